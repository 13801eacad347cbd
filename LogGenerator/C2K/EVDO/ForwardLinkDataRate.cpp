// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/EVDO/ForwardLinkDataRate.h"

#include "LogGenerator/C2K/EVDO/DataRate.h"
#include "Platform/SystemLog.h"

#include <iterator>

namespace velmora::C2K {

namespace {

// 0x1192: packet counters as the modem reports them; the packet sizes are those of 3GPP2 C.S0024.
constexpr std::size_t minimumLength = 241;
constexpr std::size_t sequenceAt = 13;
constexpr std::size_t countersAt = 17;

/// What one packet of each counter adds, in bits. The counters of weight 0 are not counted at all.
constexpr std::uint32_t weights[] = {
    128,  256,  512, 1024, 0,    128,  256,  512,  1024, 0,    128,  256,  512,  1024,
    0,    128,  256, 512,  1024, 0,    128,  256,  512,  1024, 0,    512,  1024, 2048,
    0,    128,  256, 512,  1024, 0,    512,  1024, 2048, 0,    1024, 3072, 0,    512,
    1024, 2048, 0,   4096, 0,    1024, 3072, 0,    4096, 0,    5120, 0,    5120, 0,
};
static_assert(std::size(weights) == 56 && countersAt + 4 * std::size(weights) <= minimumLength);

constexpr Field rate{"kFLDataRate", computed, real("%.2f kbps"), {.role = Role::DataRate, .absent = ""}};
constexpr DataRateKeys keys = {
    .sequence = "FLDataSeqNum",
    .sent = "FLDataSent",
    .sequence1 = "FLDataSeqNum1",
    .sent1 = "FLDataSent1",
    .sequence2 = "FLDataSeqNum2",
    .sent2 = "FLDataSent2",
};

} // namespace

std::optional<Reading> ForwardLinkDataRate::accept(const Record& record, Dictionary& state) const {
    if (record.size() < minimumLength) {
        logFormat(LogPriority::Error, "Log code 0x1192 is %d bytes long but must be at least %ld bytes.",
                  static_cast<int>(record.size()), static_cast<long>(minimumLength));
        return std::nullopt;
    }
    std::uint64_t sent = 0;
    for (std::size_t i = 0; i < std::size(weights); ++i)
        sent += std::uint64_t{record.u32(countersAt + 4 * i)} * weights[i];
    return updateDataRate(keys, record.u32(sequenceAt), sent, state);
}

void ForwardLinkDataRate::decode(const Reading& reading, FieldVisitor& visitor) const {
    visitDataRate(rate, reading, visitor);
}

void ForwardLinkDataRate::describe(ContentVisitor& visitor) const {
    visitor.field(rate);
}

} // namespace velmora::C2K

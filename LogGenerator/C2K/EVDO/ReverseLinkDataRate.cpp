// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/EVDO/ReverseLinkDataRate.h"

#include "LogGenerator/C2K/EVDO/DataRate.h"
#include "Platform/SystemLog.h"

#include <iterator>

namespace velmora::C2K {

namespace {

// 0x127E: packet counters as the modem reports them; the packet sizes are those of 3GPP2 C.S0024.
constexpr std::size_t minimumLength = 1750;
constexpr std::size_t sequenceAt = 14;

/// The offsets of a packet size's counters: two groups of four in each of three blocks.
constexpr std::size_t groupsAt[] = {18, 306};
constexpr std::size_t countersInGroup = 4;
constexpr std::size_t sizeStride = 24;
constexpr std::size_t blocks = 3;
constexpr std::size_t blockStride = 576;

/// Bits of a packet of each size.
constexpr std::uint32_t weights[] = {128, 256, 512, 768, 1024, 1536, 2048, 3072, 4096, 6144, 8192, 12288};
static_assert(std::size(weights) == 12 &&
              groupsAt[1] + 11 * sizeStride + (blocks - 1) * blockStride + 4 * countersInGroup <=
                  minimumLength);

constexpr Field rate{"kRLDataRate", computed, real("%.2f kbps"), {.role = Role::DataRate, .absent = ""}};
constexpr DataRateKeys keys = {
    .sequence = "RLDataSeqNum",
    .sent = "RLDataSent",
    .sequence1 = "RLDataSeqNum1",
    .sent1 = "RLDataSent1",
    .sequence2 = "RLDataSeqNum2",
    .sent2 = "RLDataSent2",
};

/// The sum of a group's counters.
std::uint64_t sum(const Record& counters) {
    std::uint64_t count = 0;
    for (std::size_t i = 0; i < countersInGroup; ++i)
        count += counters.u32(4 * i);
    return count;
}

/// How many packets of that size have been sent.
std::uint64_t packets(const Record& record, std::size_t size) {
    std::uint64_t count = 0;
    for (std::size_t block = 0; block < blocks; ++block)
        for (const std::size_t group : groupsAt)
            count += sum(record.part(group + sizeStride * size + blockStride * block, 4 * countersInGroup));
    return count;
}

} // namespace

std::optional<Reading> ReverseLinkDataRate::accept(const Record& record, Dictionary& state) const {
    if (record.size() < minimumLength) {
        logFormat(LogPriority::Error, "Log code 0x127e is %d bytes long but must be at least %ld bytes.",
                  static_cast<int>(record.size()), static_cast<long>(minimumLength));
        return std::nullopt;
    }
    std::uint64_t sent = 0;
    for (std::size_t size = 0; size < std::size(weights); ++size)
        sent += packets(record, size) * weights[size];
    return updateDataRate(keys, record.u32(sequenceAt), sent, state);
}

void ReverseLinkDataRate::decode(const Reading& reading, FieldVisitor& visitor) const {
    visitDataRate(rate, reading, visitor);
}

void ReverseLinkDataRate::describe(ContentVisitor& visitor) const {
    visitor.field(rate);
}

} // namespace velmora::C2K

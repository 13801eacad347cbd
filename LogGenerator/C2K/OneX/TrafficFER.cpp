// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/OneX/TrafficFER.h"

#include "LogGenerator/C2K/OneX/FrameErrorAverage.h"
#include "LogGenerator/C2K/OneX/SubPackets.h"
#include "Platform/SystemLog.h"

namespace velmora::C2K {

namespace {

// 0x119D: whether the frame was erased, as the modem reports it.
constexpr std::uint8_t trafficDemodulation = 11;
constexpr std::size_t erasureAt = 24; // in the sub-packet

constexpr Field frameErrorRate{"k1xTrafficFER", computed, real("%.02f%%"), {.role = Role::BlockErrorRate}};

} // namespace

std::optional<Reading> TrafficFER::accept(const Record& record, Dictionary& state) const {
    if (record.size() < SubPackets::minimumLength) {
        logFormat(LogPriority::Error, "Log code 0x119d is %d bytes long but must be at least %ld bytes.",
                  static_cast<int>(record.size()), static_cast<long>(SubPackets::minimumLength));
        return std::nullopt;
    }
    const SubPackets subPackets(record);
    const FoundSubPacket demodulation = subPackets.find(trafficDemodulation);
    if (demodulation.outcome == FoundSubPacket::Outcome::Missing) {
        logLine(LogPriority::Warning, "Log code 0x119d: missing traffic demod subpacket.");
        return std::nullopt;
    }
    if (!subPackets.contains(demodulation, erasureAt + 1, logCode()))
        return std::nullopt;
    const bool erased = subPackets.from(demodulation).u8(erasureAt) != 0;
    return Reading{Record(Bytes()), FrameErrorAverage(state).add(erased)};
}

void TrafficFER::decode(const Reading& reading, FieldVisitor& visitor) const {
    const auto average = static_cast<float>(*reading.number);
    visitor.real(frameErrorRate, static_cast<double>(average * 100.0F));
}

void TrafficFER::describe(ContentVisitor& visitor) const {
    visitor.field(frameErrorRate);
}

} // namespace velmora::C2K

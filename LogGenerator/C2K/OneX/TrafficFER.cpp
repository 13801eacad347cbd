// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/OneX/TrafficFER.h"

#include "LogGenerator/C2K/OneX/FrameErrorAverage.h"
#include "LogGenerator/C2K/OneX/SubPackets.h"
#include "Platform/SystemLog.h"

#include <array>
#include <cstring>

namespace velmora::C2K {

namespace {

constexpr std::uint8_t trafficDemodulation = 11;
constexpr std::size_t erasureAt = 24; // in the sub-packet

/// Of the average.
Value percentOf(Bytes bytes, const void*) {
    float average = 0;
    std::memcpy(&average, bytes.data(), sizeof average);
    return FrameErrorAverage::percent(average);
}

} // namespace

void TrafficFER::parse(const Record& record, Dictionary& state, const Publisher& publisher) const {
    if (record.size() < SubPackets::minimumLength) {
        logFormat(LogPriority::Error, "Log code 0x119d is %d bytes long but must be at least %ld bytes.",
                  static_cast<int>(record.size()), static_cast<long>(SubPackets::minimumLength));
        return;
    }
    const SubPackets subPackets(record);
    const FoundSubPacket demodulation = subPackets.find(trafficDemodulation);
    if (demodulation.outcome == FoundSubPacket::Outcome::Missing) {
        logLine(LogPriority::Warning, "Log code 0x119d: missing traffic demod subpacket.");
        return;
    }
    if (!subPackets.reaches(demodulation, erasureAt + 1, logCode()))
        return;
    const bool erased = subPackets.from(demodulation).u8(erasureAt) != 0;
    const float average = FrameErrorAverage(state).add(erased);
    std::array<std::uint8_t, sizeof average> bytes;
    std::memcpy(bytes.data(), &average, sizeof average);
    publisher.publishLater("k1xTrafficFER", percentOf, nullptr, bytes);
}

} // namespace velmora::C2K

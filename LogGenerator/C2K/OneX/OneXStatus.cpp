// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/OneX/OneXStatus.h"

#include "LogGenerator/C2K/OneX/ActiveSetInfo.h"
#include "LogGenerator/C2K/OneX/FrameErrorAverage.h"
#include "LogGenerator/C2K/OneX/SubPackets.h"
#include "LogGenerator/C2K/ValueField.h"
#include "Platform/SystemLog.h"

namespace velmora::C2K {

namespace {

// Sub-packets.
constexpr std::uint8_t systemState = 1;
constexpr std::uint8_t radioFrequency = 2;
constexpr std::uint8_t activeSet = 3;
constexpr std::uint8_t fingerInformation = 4; // must be there, and is not read

constexpr EnumText deviceStateRows[] = {
    {0, "Inactive [0]"},
    {1, "Deep sleep in start state [1]"},
    {2, "Initial state for CDMA operation [2]"},
    {3, "Acquisition [3]"},
    {4, "Sync [4]"},
    {5, "Slew [5]"},
    {6, "Paging [6]"},
    {7, "Slotted mode sleep state [7]"},
    {8, "Traffic [8]"},
    {9, "UnSlew [9]"},
    {10, "Operation in PCG state [10]"},
    {11, "Powerup state [11]"},
};
constexpr NumberedTexts deviceStates(deviceStateRows, "[Bad Value ", "]");
constexpr std::uint8_t trafficState = 8;

constexpr ValueField systemStateFields[] = {
    {"k1xDeviceState", u8At(4), deviceStates},
};

constexpr Shown receiveLevel = real("%+.2f dBm", 0.334, -63.248);

constexpr ValueField radioFields[] = {
    {"k1xRx0BandClass", u8At(4), bandClasses},
    {"k1xRx0ChanNum", u16At(6), integer("%d")},
    {"k1xRxAGC0", i8At(10), receiveLevel},
    {"k1xRx1BandClass", u8At(5), bandClasses, When::Connected},
    {"k1xRx1ChanNum", u16At(8), integer("%d"), When::Connected},
    {"k1xRxAGC1", i8At(11), receiveLevel, When::Connected},
    {"k1xTxAGC", i16At(12), real("%+.2f dBm", 0.1), When::Connected},
};

/// Of the sub-packet.
Value pilotsOf(Bytes bytes, const void*) {
    return ActiveSetInfo(Record(bytes)).pilots();
}

} // namespace

void OneXStatus::parse(const Record& record, Dictionary& state, const Publisher& publisher) const {
    if (record.size() < SubPackets::minimumLength) {
        logFormat(LogPriority::Error, "Log code 0x119c is %u bytes long but must be at least %lu bytes.",
                  lengthOf(record), static_cast<unsigned long>(SubPackets::minimumLength));
        return;
    }
    const SubPackets subPackets(record);
    const FoundSubPacket system = subPackets.find(systemState);
    const FoundSubPacket radio = subPackets.find(radioFrequency);
    const FoundSubPacket active = subPackets.find(activeSet);
    const FoundSubPacket fingers = subPackets.find(fingerInformation);
    for (const FoundSubPacket& each : {system, radio, active, fingers})
        if (each.outcome == FoundSubPacket::Outcome::Outside) {
            static_cast<void>(subPackets.reaches(each, SubPackets::headerLength, logCode()));
            return;
        }
    if (!system.found() || !radio.found() || !active.found() || !fingers.found()) {
        logFormat(LogPriority::Warning, "Log code 0x119c: missing subpacket (ss=%d,rf=%d,ai=%d,fi=%d).",
                  int{system.found()}, int{radio.found()}, int{active.found()}, int{fingers.found()});
        return;
    }

    // All that is needed is looked for first, so that a record is shown whole or not at all.
    if (!subPackets.reaches(system, endOf(systemStateFields, true), logCode()))
        return;
    const bool traffic = systemStateFields[0].where.read(subPackets.from(system)) == trafficState;
    if (!subPackets.reaches(radio, endOf(radioFields, traffic), logCode()) ||
        !subPackets.reaches(active, ActiveSetInfo::headerLength, logCode()))
        return;
    const ActiveSetInfo activeSetInfo(subPackets.from(active));
    if (!subPackets.reaches(active, activeSetInfo.neededLength(), logCode()))
        return;

    publishFields(publisher, subPackets.from(system), systemStateFields, traffic);
    publishFields(publisher, subPackets.from(radio), radioFields, traffic);
    publisher.publishLater("k1xActiveSetInfo", pilotsOf, nullptr,
                           record.part(active.offset, activeSetInfo.neededLength()).bytes());
    if (traffic)
        return;
    FrameErrorAverage average(state);
    if (const std::optional<float> last = average.value()) {
        publisher.publish("k1xTrafficFER", FrameErrorAverage::percent(*last) + " (old)");
        average.clear();
    }
}

} // namespace velmora::C2K

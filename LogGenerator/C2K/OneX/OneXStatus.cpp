// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/OneX/OneXStatus.h"

#include "LogGenerator/C2K/BandClasses.h"
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

// 0x119C, sub-packet 1: as the modem reports it.
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
constexpr EnumTexts deviceStates(deviceStateRows, "[Bad Value ", "]");
constexpr std::uint8_t trafficState = 8;

constexpr ValueField systemStateFields[] = {
    {"k1xDeviceState", u8At(4), text(deviceStates), {.role = Role::RadioState}},
};

// 0x119C, sub-packet 2: band class (3GPP2 C.S0057), CDMA channel number (C.S0057); levels on the modem's own
// scales, 0.334 dB from -63.248 dBm and 0.1 dBm.
constexpr TextFormat receiveLevel = real("%+.2f dBm", 0.334, -63.248);

constexpr ValueField radioFields[] = {
    {"k1xRx0BandClass", u8At(4), text(bandClasses), {.clause = "3GPP2 C.S0057 1.5"}},
    {"k1xRx0ChanNum", u16At(6), integer("%d"), {.role = Role::ServingChannel, .clause = "3GPP2 C.S0057"}},
    {"k1xRxAGC0", i8At(10), receiveLevel, {.role = Role::ServingLevel}},
    {"k1xRx1BandClass",
     u8At(5),
     text(bandClasses),
     Validity::WhileConnected,
     {.clause = "3GPP2 C.S0057 1.5"}},
    {"k1xRx1ChanNum", u16At(8), integer("%d"), Validity::WhileConnected, {.clause = "3GPP2 C.S0057"}},
    {"k1xRxAGC1", i8At(11), receiveLevel, Validity::WhileConnected},
    {"k1xTxAGC", i16At(12), real("%+.2f dBm", 0.1), Validity::WhileConnected},
};

constexpr Field oldFrameErrorRate{
    "k1xTrafficFER", computed, real("%.02f%% (old)"), {.role = Role::BlockErrorRate}};
constexpr KeptRecords::Parts status = 1;
constexpr KeptRecords::Parts closedAverage = 2;

bool isTraffic(const Record& systemStatePacket) {
    return systemStateFields[0].field.place.read(systemStatePacket) == trafficState;
}

/// Precondition: `accept` has found all of it.
void visitStatus(const Record& record, FieldVisitor& visitor) {
    const SubPackets subPackets(record);
    const Record system = subPackets.from(subPackets.find(systemState));
    const bool traffic = isTraffic(system);
    visitFields(systemStateFields, system, traffic, visitor);
    visitFields(radioFields, subPackets.from(subPackets.find(radioFrequency)), traffic, visitor);
    ActiveSetInfo(subPackets.from(subPackets.find(activeSet))).visitPilots(visitor);
}

} // namespace

std::optional<Reading> OneXStatus::accept(const Record& record, Dictionary& state) const {
    if (record.size() < SubPackets::minimumLength) {
        logFormat(LogPriority::Error, "Log code 0x119c is %u bytes long but must be at least %lu bytes.",
                  lengthOf(record), static_cast<unsigned long>(SubPackets::minimumLength));
        return std::nullopt;
    }
    const SubPackets subPackets(record);
    const FoundSubPacket system = subPackets.find(systemState);
    const FoundSubPacket radio = subPackets.find(radioFrequency);
    const FoundSubPacket active = subPackets.find(activeSet);
    const FoundSubPacket fingers = subPackets.find(fingerInformation);
    for (const FoundSubPacket& each : {system, radio, active, fingers})
        if (each.outcome == FoundSubPacket::Outcome::PastEnd) {
            static_cast<void>(subPackets.contains(each, SubPackets::headerLength, logCode()));
            return std::nullopt;
        }
    if (!system.found() || !radio.found() || !active.found() || !fingers.found()) {
        logFormat(LogPriority::Warning, "Log code 0x119c: missing subpacket (ss=%d,rf=%d,ai=%d,fi=%d).",
                  int{system.found()}, int{radio.found()}, int{active.found()}, int{fingers.found()});
        return std::nullopt;
    }

    // All that is needed is checked first, so that a record is shown completely or not at all.
    if (!subPackets.contains(system, endOf(systemStateFields, true), logCode()))
        return std::nullopt;
    const bool traffic = isTraffic(subPackets.from(system));
    if (!subPackets.contains(radio, endOf(radioFields, traffic), logCode()) ||
        !subPackets.contains(active, ActiveSetInfo::headerLength, logCode()))
        return std::nullopt;
    const ActiveSetInfo activeSetInfo(subPackets.from(active));
    if (!subPackets.contains(active, activeSetInfo.neededLength(), logCode()))
        return std::nullopt;

    Reading reading{record, std::nullopt, status};
    if (traffic)
        return reading;
    FrameErrorAverage average(state);
    if (const std::optional<float> last = average.value()) {
        reading.number = *last;
        reading.parts |= closedAverage;
        average.clear();
    }
    return reading;
}

void OneXStatus::decode(const Reading& reading, FieldVisitor& visitor) const {
    if ((reading.parts & status) != 0)
        visitStatus(reading.record, visitor);
    if ((reading.parts & closedAverage) != 0) {
        const auto average = static_cast<float>(*reading.number);
        visitor.real(oldFrameErrorRate, static_cast<double>(average * 100.0F));
    }
}

void OneXStatus::describe(ContentVisitor& visitor) const {
    visitor.subPacket(systemState);
    describeFields(systemStateFields, visitor);
    visitor.subPacket(radioFrequency);
    describeFields(radioFields, visitor);
    visitor.subPacket(activeSet);
    visitor.list(ActiveSetInfo::pilotList);
    visitor.subPacket(0);
    visitor.field(oldFrameErrorRate);
}

} // namespace velmora::C2K

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/EVDO/EVDOStatus.h"

#include "LogGenerator/C2K/BandClasses.h"
#include "LogGenerator/C2K/ValueField.h"
#include "Platform/SystemLog.h"

namespace velmora::C2K {

namespace {

// 0x1183: band class and channel (3GPP2 C.S0057), PN offset in units of 64 chips, UATI and color code
// (C.S0024); session and device states have the modem's own numbers, levels are as it reports them.
constexpr std::size_t exactLength = 50;

constexpr EnumText deviceStateRows[] = {
    {0, "Inactive [0]"}, {1, "Acquisition [1]"}, {2, "Sync [2]"},
    {3, "Idle [3]"},     {4, "Access [4]"},      {5, "Connected [5]"},
};
constexpr EnumTexts deviceStates(deviceStateRows, "[Reserved ", "]");
constexpr std::uint8_t accessState = 4;

constexpr EnumText sessionStateRows[] = {
    {0, "Closed [0]"},        {1, "AMP setup [1]"}, {2, "AT-initiated neg [2]"},
    {3, "Initiated neg [3]"}, {4, "Open [4]"},
};
constexpr EnumTexts sessionStates(sessionStateRows, "[Reserved ", "]");

constexpr Place deviceState = u8At(36);

constexpr ValueField fields[] = {
    {"kChannel", bitsAt(13, 0, 11), integer("%d"), {.role = Role::ServingChannel, .clause = "3GPP2 C.S0057"}},
    {"k1xEVDODeviceState",
     deviceState,
     text(deviceStates),
     {.role = Role::RadioState}}, // published second, earlier than its offset
    {"kBandClass", bitsAt(14, 3, 5), text(bandClasses), {.clause = "3GPP2 C.S0057 1.5"}},
    {"kRxAGC0", i8At(15), integer("%+d dBm"), {.role = Role::ServingLevel}},
    {"kRxAGC1", i8At(16), integer("%+d dBm"), Validity::WhileConnected},
    {"kTxAGC", i8At(17), integer("%+d dBm"), Validity::WhileConnected},
    {"kServingPNOffset",
     u16At(18),
     unless(0xFFFF, "Invalid Value", integer("%d \u00D7 64chips")),
     {.role = Role::ServingPhysicalCell, .clause = "3GPP2 C.S0024"}},
    {"kSessionState", u8At(37), text(sessionStates)},
    {"kUATI24",
     bitsAt(38, 0, 24),
     hexadecimal(),
     {.identity = Identity::Subscriber, .clause = "3GPP2 C.S0024"}},
    {"kColorCode", u8At(41), integer("%d"), {.identity = Identity::Location, .clause = "3GPP2 C.S0024"}},
};
static_assert(endOf(fields, true) <= exactLength);

} // namespace

std::optional<Reading> EVDOStatus::accept(const Record& record, Dictionary&) const {
    if (record.size() != exactLength) {
        logFormat(LogPriority::Error, "Log code 0x1183 is %u bytes long but should be %lu bytes.",
                  lengthOf(record), static_cast<unsigned long>(exactLength));
        return std::nullopt;
    }
    return Reading{record};
}

void EVDOStatus::decode(const Reading& reading, FieldVisitor& visitor) const {
    // A reserved state above Connected counts as connected.
    visitFields(fields, reading.record, deviceState.read(reading.record) >= accessState, visitor);
}

void EVDOStatus::describe(ContentVisitor& visitor) const {
    describeFields(fields, visitor);
}

} // namespace velmora::C2K

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/OneX/SystemIdentification.h"

#include "LogGenerator/C2K/ValueField.h"
#include "Platform/SystemLog.h"

namespace velmora::C2K {

namespace {

// 0x134F: roaming indicator (3GPP2 C.R1001); SID, NID, base station identity and protocol revision (C.S0005).
// The system types are as the modem reports them.
constexpr std::size_t minimumLength = 171;
constexpr std::size_t versionAt = 13;
constexpr int leastVersion = 2;

constexpr EnumText roamingIndicatorRows[] = {
    {0, "OFF [0]"},
    {1, "ON [1]"},
    {2, "Flashing [2]"},
    {3, "Out of Neighborhood [3]"},
    {4, "Out of Building [4]"},
    {5, "Preferred system [5]"},
    {6, "Available system [6]"},
    {7, "Alliance partner [7]"},
    {8, "Premium partner [8]"},
    {9, "Full service functionality [9]"},
    {10, "Partial service functionality [10]"},
    {11, "Banner ON [11]"},
    {12, "Banner OFF [12]"},
};
constexpr EnumTexts roamingIndicators(roamingIndicatorRows, "ERI - ", "");

constexpr ValueField roaming[] = {
    {"k1xRoamingHome", u32At(42), text(roamingIndicators), {.clause = "3GPP2 C.R1001"}},
};
constexpr std::size_t systemTypeAt = 46;
constexpr std::uint32_t cdmaSystem = 2;
constexpr ValueField identities[] = {
    // In a system of another type these bytes mean something else.
    {"kSystemId", u16At(50), integer("%d"), {.identity = Identity::Location, .clause = "3GPP2 C.S0005"}},
    {"kNetworkId", u16At(52), integer("%d"), {.identity = Identity::Location, .clause = "3GPP2 C.S0005"}},
};
constexpr ValueField zone[] = {
    {"kPacketZoneId", u8At(131), integer("%d"), {.identity = Identity::Location, .clause = "3GPP2 C.S0005"}},
};
constexpr ValueField baseStation[] = {
    {"kBaseId",
     u16At(184),
     integer("%d"),
     {.role = Role::ServingCell,
      .identity = Identity::Location,
      .clause = "3GPP2 C.S0005"}}, // past the minimum length
};
constexpr ValueField revision[] = {
    {"kProtocolRevision", u8At(133), integer("%d"), {.clause = "3GPP2 C.S0005"}},
};
static_assert(endOf(roaming, true) <= minimumLength && endOf(identities, true) <= minimumLength &&
              endOf(zone, true) <= minimumLength && endOf(revision, true) <= minimumLength);

/// Shown in place of the identities of a system of another type.
constexpr EnumTexts unknownTypes("(unknown system type ", ")");
constexpr Meaning noIdentity{.isAbsence = true};
constexpr Field unknownSystem{"kSystemId", u32At(systemTypeAt), text(unknownTypes), noIdentity};
constexpr Field unknownNetwork{"kNetworkId", u32At(systemTypeAt), text(unknownTypes), noIdentity};

constexpr KeptRecords::Parts identification = 1;
constexpr KeptRecords::Parts baseStationPart = 2;

void visitIdentities(const Record& record, FieldVisitor& visitor) {
    if (record.u32(systemTypeAt) == cdmaSystem) {
        visitFields(identities, record, true, visitor);
    } else {
        visitor.number(unknownSystem, unknownSystem.place.read(record));
        visitor.number(unknownNetwork, unknownNetwork.place.read(record));
    }
}

} // namespace

std::optional<Reading> SystemIdentification::accept(const Record& record, Dictionary&) const {
    if (record.size() < minimumLength) {
        logFormat(LogPriority::Error, "Log code 0x134f is %d bytes long but must be at least %lu bytes.",
                  static_cast<int>(record.size()), static_cast<unsigned long>(minimumLength));
        return std::nullopt;
    }
    const int version = record.u8(versionAt);
    if (version < leastVersion) {
        logFormat(LogPriority::Error,
                  "Log code 0x134f has version=%d; only version 2 or higher expected; dropping.", version);
        return std::nullopt;
    }
    if (record.size() >= endOf(baseStation, true))
        return Reading{record, std::nullopt, identification | baseStationPart};
    logFormat(LogPriority::Error,
              "Log code 0x134f is %d bytes long but must be at least %lu bytes for the base station id.",
              static_cast<int>(record.size()), static_cast<unsigned long>(endOf(baseStation, true)));
    return Reading{record, std::nullopt, identification, true};
}

void SystemIdentification::decode(const Reading& reading, FieldVisitor& visitor) const {
    const Record& record = reading.record;
    if ((reading.parts & identification) != 0) {
        visitFields(roaming, record, true, visitor);
        visitIdentities(record, visitor);
        visitFields(zone, record, true, visitor);
    }
    if ((reading.parts & baseStationPart) != 0)
        visitFields(baseStation, record, true, visitor);
    if ((reading.parts & identification) != 0)
        visitFields(revision, record, true, visitor);
}

void SystemIdentification::describe(ContentVisitor& visitor) const {
    for (const std::span<const ValueField> fields :
         {std::span<const ValueField>(roaming), {identities}, {zone}, {baseStation}, {revision}})
        describeFields(fields, visitor);
    visitor.field(unknownSystem);
    visitor.field(unknownNetwork);
}

} // namespace velmora::C2K

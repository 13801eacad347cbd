// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/Registration/ServingPLMN.h"

#include "Platform/SystemLog.h"
#include "Platform/TelephonyService.h"

namespace velmora {

namespace {

// 0x7132: as the modem reports it.
constexpr EnumText selectionModeRows[] = {
    {0, "Automatic"}, {1, "Manual"}, {2, "Limited"}, {3, "LIMITED_ROUTINE_ACQ"}, {4, "LIMITED_MANUAL_ACQ"},
};
constexpr EnumTexts selectionModes(selectionModeRows, "Unknown");

// As the modem reports them.
constexpr EnumText serviceTypeRows[] = {
    {0, "NO_SERVICE"}, {1, "CS_ONLY"}, {2, "PS_ONLY"}, {3, "CS_PS_SERVICE"}, {4, "LIMITED_SERVICE"},
};
constexpr EnumTexts serviceTypes(serviceTypeRows, "Unknown");

constexpr Field selectionFields[] = {
    {"PLMN Sel Mod", u8At(14), text(selectionModes), {.clause = "3GPP TS 23.122 4.4"}},
};
constexpr Layout selection = layout(16, selectionFields);

// 0x7135: the location area identification (3GPP TS 24.008 10.5.1.3) at 15 to 19, its PLMN identity first,
// and the RAC (TS 24.008 10.5.5.15).
constexpr Field areaFields[] = {
    {"Location Area Code",
     u16BigEndianAt(18),
     integer("%d"),
     {.role = Role::ServingArea, .identity = Identity::Location, .clause = "3GPP TS 23.003 4.1"}},
    {"Routing Area Code",
     u8At(20),
     integer("%d"),
     {.identity = Identity::Location, .clause = "3GPP TS 23.003 4.2"}},
    {"Service Type", u8At(14), text(serviceTypes)},
};
constexpr Layout areas = layout(32, areaFields);
constexpr std::uint32_t identityCode = 0x7135;
constexpr Field countryCode{"Mobile Country Code",
                            computed,
                            plainText(),
                            {.role = Role::ServingCountryCode,
                             .digits = 3,
                             .identity = Identity::Location,
                             .clause = "3GPP TS 23.003 2.2"}};
constexpr Field networkCode{"Mobile Network Code",
                            computed,
                            plainText(),
                            {.role = Role::ServingNetworkCode,
                             .digits = 2,
                             .identity = Identity::Location,
                             .clause = "3GPP TS 23.003 2.2"}};

/// A BCD digit as its character; a filler (10 and above) is a blank.
char digit(unsigned halfByte) {
    return static_cast<char>(halfByte < 10 ? '0' + halfByte : ' ');
}

void visitIdentity(const Record& record, FieldVisitor& visitor) {
    // BCD as in 3GPP TS 24.008, 10.5.1.3: two digits a byte, the lower half first, MNC digit 3 in the middle
    // byte. A two-digit MNC so ends in a blank.
    const char mcc[] = {digit(record.bits(15, 0, 4)), digit(record.bits(15, 4, 4)),
                        digit(record.bits(16, 0, 4))};
    const char mnc[] = {digit(record.bits(17, 0, 4)), digit(record.bits(17, 4, 4)),
                        digit(record.bits(16, 4, 4))};
    visitor.text(countryCode, {mcc, sizeof mcc});
    visitor.text(networkCode, {mnc, sizeof mnc});
    visitor.fields(record, areas);
}

// As the telephony service reports it: plain decimal numbers, so that a leading zero of the MNC is lost,
// under the labels that 0x7135 writes as three characters: whichever arrived last is shown.
constexpr CellField cellFields[] = {
    {kVoxCellMonitorMCC,
     CellNumber::Whole,
     "Mobile Country Code",
     integer("%d"),
     "ServingPLMN: Failed to retrieve MCC\n",
     {.role = Role::ServingCountryCode,
      .digits = 3,
      .identity = Identity::Location,
      .clause = "3GPP TS 23.003 2.2"}},
    {kVoxCellMonitorMNC,
     CellNumber::Whole,
     "Mobile Network Code",
     integer("%d"),
     "ServingPLMN: Failed to retrieve MNC\n",
     {.role = Role::ServingNetworkCode,
      .digits = 2,
      .identity = Identity::Location,
      .clause = "3GPP TS 23.003 2.2"}},
    {kVoxCellMonitorLAC,
     CellNumber::Whole,
     "Location Area Code",
     integer("%d"),
     "ServingPLMN: Failed to retrieve LAC\n",
     {.role = Role::ServingArea, .identity = Identity::Location, .clause = "3GPP TS 23.003 4.1"}},
};

constexpr CellKind cellKinds[] = {
    {kVoxCellMonitorRadioAccessTechnologyGSM, kVoxCellMonitorCellTypeServing},
    {kVoxCellMonitorRadioAccessTechnologyUMTS, kVoxCellMonitorCellTypeServing},
};
constexpr CellTable servingCell{cellKinds, CellTable::Shown::First, cellFields};
constexpr Content identityContents[] = {countryCode, networkCode, areas};
constexpr View sectionViews[] = {
    {identityCode, areas.minimumLength, identityContents},
    {0x7132, selection},
    cellInformation,
};

} // namespace

std::span<const View> ServingPLMN::views() const {
    return sectionViews;
}

void ServingPLMN::trace() const {
    logLine(LogPriority::Warning, "Serving PLMN");
}

const CellTable& ServingPLMN::cellTable() const {
    return servingCell;
}

void ServingPLMN::decode(const View& view, const Record& record, FieldVisitor& visitor) const {
    if (view.code == identityCode)
        visitIdentity(record, visitor);
    else
        CellSection::decode(view, record, visitor);
}

} // namespace velmora

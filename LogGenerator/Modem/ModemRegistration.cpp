// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/ModemRegistration.h"

#include "LogGenerator/Modem/Cells/CellRanges.h"
#include "LogGenerator/Modem/Cells/ReportedCell.h"
#include "LogGenerator/Modem/Values/Enumerations.h"
#include "LogGenerator/Modem/Values/ValueRow.h"
#include "LogMessages/LiveModem.h"

namespace velmora {

using namespace LiveModem;

namespace {

constexpr View registrationViews[] = {{LiveModemCode::registration, std::size_t{0}}};

constexpr Range enumerated{0, 0x7FFFFFFE};
constexpr Range known{1, 0x7FFFFFFE}; // 0: unknown

constexpr ValueRow state{kVoxRegistrationState,
                         {"Registration State",
                          computed,
                          text(registrationStates),
                          {.role = Role::RegistrationState, .clause = "3GPP TS 27.007 7.2"}},
                         enumerated};
constexpr Field roaming{"Roaming", computed, flag("Yes", "No")};
constexpr ValueRow rows[] = {
    {.key = kVoxRegistrationPLMN,
     .field = {"PLMN", computed, plainText(), {.clause = "3GPP TS 23.003 2.2"}},
     .toText = networkText},
    {kVoxRegistrationOperator, {"Operator", computed, plainText()}},
    {kVoxRegistrationPacketService, {"Packet Service", computed, text(packetServiceStates)}, known},
    {kVoxRegistrationCDMA1x, {"CDMA 1x Registration", computed, text(cdmaRegistrationStates)}, known},
    {kVoxRegistrationEVDO, {"EV-DO Registration", computed, text(cdmaRegistrationStates)}, known},
    {kVoxRegistrationSID,
     {"SID", computed, integer("%d"), {.identity = Identity::Location}},
     CellRange::systemID},
    {kVoxRegistrationNID,
     {"NID", computed, integer("%d"), {.identity = Identity::Location}},
     CellRange::networkID},
};

/// Whether a registered modem roams; absent for one that is not registered.
std::optional<bool> isRoaming(std::int64_t registration) {
    switch (registration) {
    case 1:
    case 6:
    case 9: return false;
    case 5:
    case 7:
    case 10: return true;
    default: return std::nullopt;
    }
}

} // namespace

std::span<const View> ModemRegistration::views() const {
    return registrationViews;
}

void ModemRegistration::show(const Dictionary& message, FieldVisitor& visitor) const {
    visitValue(message[state.key], state, visitor);
    if (const auto registration = wholeNumberOf(message[state.key], state.range))
        if (const auto roams = isRoaming(*registration))
            visitor.number(roaming, *roams ? 1 : 0);
    visitValues(message, rows, visitor);
}

void ModemRegistration::describeShown(ContentVisitor& visitor) const {
    visitor.field(state.field);
    visitor.field(roaming);
    describeValues(rows, visitor);
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/ModemEquipment.h"

#include "LogGenerator/Modem/Values/Enumerations.h"
#include "LogGenerator/Modem/Values/Masks.h"
#include "LogGenerator/Modem/Values/ValueRow.h"
#include "LogMessages/LiveModem.h"

namespace velmora {

using namespace LiveModem;

namespace {

constexpr View modemViews[] = {{LiveModemCode::modem, std::size_t{0}}};

constexpr Range known{1, 0x7FFFFFFE}; // 0: unknown or none

constexpr ValueRow modemRows[] = {
    {kVoxModemManufacturer, {"Manufacturer", computed, plainText()}},
    {kVoxModemModel, {"Model", computed, plainText()}},
    {kVoxModemRevision, {"Revision", computed, plainText()}},
    {kVoxModemHardware, {"Hardware Revision", computed, plainText()}},
    {kVoxModemEquipment,
     {"Equipment ID",
      computed,
      plainText(),
      {.identity = Identity::Equipment, .clause = "3GPP TS 23.003 6.2"}}},
    {kVoxModemState, {"Modem State", computed, text(modemStates)}, {-1, 0x7FFFFFFE}},
    {kVoxModemFailedReason, {"Failure", computed, text(failures)}, known},
    {kVoxModemLock, {"Lock", computed, text(locks)}, {2, 0x7FFFFFFE}}, // 1: none
    {kVoxModemPowerState, {"Power State", computed, text(powerStates)}, known},
    {.key = kVoxModemCapabilities, .field = {"Capabilities", computed, plainText()}, .toText = capabilities},
    {kVoxModemDrivers, {"Drivers", computed, plainText()}},
    {kVoxModemPlugin, {"Plugin", computed, plainText()}},
    {kVoxModemPort, {"Primary Port", computed, plainText()}},
    {kVoxModemDevice, {"Device", computed, plainText()}},
    {kVoxModemIndex, {"Index", computed, integer("%d")}, {0, 0x7FFFFFFE}},
    {kVoxModemManagerVersion, {"ModemManager Version", computed, plainText()}},
};

} // namespace

std::span<const View> ModemEquipment::views() const {
    return modemViews;
}

void ModemEquipment::show(const Dictionary& message, FieldVisitor& visitor) const {
    visitValues(message, modemRows, visitor);
}

void ModemEquipment::describeShown(ContentVisitor& visitor) const {
    describeValues(modemRows, visitor);
}

} // namespace velmora

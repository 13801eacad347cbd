// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/ModemSIMSlots.h"

#include "LogGenerator/Modem/Cells/ReportedCell.h"
#include "LogGenerator/Modem/ModemStatus.h"
#include "LogGenerator/Modem/Values/ValueRow.h"
#include "LogMessages/LiveModem.h"

namespace velmora {

using namespace LiveModem;

namespace {

constexpr View slotViews[] = {{LiveModemCode::sim, std::size_t{0}}};

constexpr ValueRow slotRows[] = {
    {kVoxSIMSlotNumber, {"Slot", computed, integer("%d")}, {1, 0x7FFFFFFE}},
    {kVoxSIMSlotIsActive, {"Active", computed, flag("Yes", "No")}},
    {kVoxSIMSlotHasSIM, {"SIM", computed, flag("Present", "Absent")}},
    {kSimFile_ICCID,
     {"ICCID", computed, plainText(), {.identity = Identity::Subscriber, .clause = "ETSI TS 102 221 13.2"}}},
    {kVoxSIMOperatorName, {"Operator", computed, plainText()}},
    {.key = kVoxSIMOperatorCode,
     .field = {"Operator PLMN", computed, plainText(), {.clause = "3GPP TS 23.003 2.2"}},
     .toText = networkText},
};
constexpr std::string_view rowKeys[] = {"Slot"};
constexpr List slotList{.label = "Slots", .keys = rowKeys};

} // namespace

std::span<const View> ModemSIMSlots::views() const {
    return slotViews;
}

std::string ModemSIMSlots::stateOf(const Dictionary& message) const {
    return arrayIn(message, kVoxSIMSlots).empty() ? "One slot" : workingState(message);
}

void ModemSIMSlots::show(const Dictionary& message, FieldVisitor& visitor) const {
    visitor.beginList(slotList);
    for (const Value& each : arrayIn(message, kVoxSIMSlots)) {
        visitor.beginRow();
        visitValues(dictionaryOf(each), slotRows, visitor);
        visitor.endRow();
    }
    visitor.endList();
}

void ModemSIMSlots::describeShown(ContentVisitor& visitor) const {
    visitor.beginList(slotList);
    describeValues(slotRows, visitor);
    visitor.endList();
}

} // namespace velmora

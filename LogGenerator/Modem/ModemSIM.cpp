// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/ModemSIM.h"

#include "LogGenerator/Modem/Cells/ReportedCell.h"
#include "LogGenerator/Modem/Values/Enumerations.h"
#include "LogGenerator/Modem/Values/Masks.h"
#include "LogGenerator/Modem/Values/ValueRow.h"
#include "LogMessages/LiveModem.h"

namespace velmora {

using namespace LiveModem;

namespace {

constexpr View simViews[] = {{LiveModemCode::sim, std::size_t{0}}};

constexpr Identity subscriber = Identity::Subscriber;

constexpr ValueRow simRows[] = {
    {kVoxSIMType, {"Type", computed, text(simTypes)}, {1, 0x7FFFFFFE}}, // 0: unknown
    {kSimFile_ICCID,
     {"ICCID", computed, plainText(), {.identity = subscriber, .clause = "ETSI TS 102 221 13.2"}}},
    {kVoxSIMIMSI, {"IMSI", computed, plainText(), {.identity = subscriber, .clause = "3GPP TS 23.003 2.2"}}},
    {kSimFile_MSISDN,
     {"MSISDN", computed, plainText(), {.identity = subscriber, .clause = "3GPP TS 31.102 4.2.26"}}},
    {kVoxSIMEID, {"EID", computed, plainText(), {.identity = subscriber}}},
    {.key = kVoxSIMOperatorCode,
     .field = {"Operator PLMN", computed, plainText(), {.clause = "3GPP TS 23.003 2.2"}},
     .toText = networkText},
    {kVoxSIMOperatorName, {"Operator", computed, plainText()}},
    {kVoxSIMGroup1, {"GID1", computed, plainText(), {.clause = "3GPP TS 31.102 4.2.10"}}},
    {kVoxSIMGroup2, {"GID2", computed, plainText(), {.clause = "3GPP TS 31.102 4.2.11"}}},
    {kVoxSIMEmergencyNumbers,
     {"Emergency Numbers", computed, plainText(), {.clause = "3GPP TS 31.102 4.2.21"}}},
};
constexpr ValueRow networkRows[] = {
    {.key = kVoxSIMOperatorCode,
     .field = {"PLMN", computed, plainText(), {.clause = "3GPP TS 31.102 4.2.5"}},
     .toText = networkText},
    {.key = kVoxLinkAccessTechnologies,
     .field = {"Access Technologies", computed, plainText()},
     .toText = accessTechnologies},
};
constexpr List networkList{.label = "Preferred Networks"};

} // namespace

std::span<const View> ModemSIM::views() const {
    return simViews;
}

void ModemSIM::show(const Dictionary& message, FieldVisitor& visitor) const {
    visitValues(message, simRows, visitor);
    visitor.beginList(networkList);
    for (const Value& each : arrayIn(message, kVoxSIMPreferredNetworks)) {
        visitor.beginRow();
        visitValues(dictionaryOf(each), networkRows, visitor);
        visitor.endRow();
    }
    visitor.endList();
}

void ModemSIM::describeShown(ContentVisitor& visitor) const {
    describeValues(simRows, visitor);
    visitor.beginList(networkList);
    describeValues(networkRows, visitor);
    visitor.endList();
}

} // namespace velmora

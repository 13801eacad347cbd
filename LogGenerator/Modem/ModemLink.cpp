// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/ModemLink.h"

#include "LogGenerator/Modem/Cells/CellRanges.h"
#include "LogGenerator/Modem/Values/Masks.h"
#include "LogGenerator/Modem/Values/ValueRow.h"
#include "LogMessages/LiveModem.h"

namespace velmora {

using namespace LiveModem;

namespace {

constexpr View linkViews[] = {{LiveModemCode::link, std::size_t{0}}};

constexpr Range percent{0, 100};

constexpr ValueRow linkRows[] = {
    {.key = kVoxLinkAccessTechnologies,
     .field = {"Access Technologies", computed, plainText()},
     .toText = accessTechnologies},
    {kVoxLinkSignalQuality, {"Signal Quality", computed, integer("%d%%")}, percent},
    {kVoxLinkIsRecent, {"Signal Quality Is Recent", computed, flag("Yes", "No")}},
};

constexpr ValueRow gsmRows[] = {
    {kVoxLinkRSSI,
     {"GSM RSSI", computed, real("%.1f dBm"), {.clause = "3GPP TS 45.008 8.1.4"}},
     CellRange::rssi},
    {kVoxLinkErrorRate, {"GSM Error Rate", computed, real("%.2f%%")}, percent},
};
constexpr ValueRow umtsRows[] = {
    {kVoxLinkRSSI, {"UMTS RSSI", computed, real("%.1f dBm")}, CellRange::rssi},
    {kVoxLinkRSCP,
     {"UMTS RSCP", computed, real("%.1f dBm"), {.clause = "3GPP TS 25.215 5.1.1"}},
     CellRange::rscp},
    {kVoxLinkECIO,
     {"UMTS Ec-Io", computed, real("%.1f dB"), {.clause = "3GPP TS 25.215 5.1.5"}},
     CellRange::ecn0},
    {kVoxLinkErrorRate, {"UMTS Error Rate", computed, real("%.2f%%")}, percent},
};
constexpr ValueRow lteRows[] = {
    {kVoxLinkRSRP,
     {"LTE RSRP", computed, real("%.1f dBm"), {.clause = "3GPP TS 36.214 5.1.1"}},
     CellRange::rsrp},
    {kVoxLinkRSRQ,
     {"LTE RSRQ", computed, real("%.1f dB"), {.clause = "3GPP TS 36.214 5.1.3"}},
     CellRange::rsrq},
    {kVoxLinkSINR,
     {"LTE SINR", computed, real("%.1f dB"), {.clause = "3GPP TS 36.214 5.1.13"}},
     CellRange::sinr},
    {kVoxLinkRSSI, {"LTE RSSI", computed, real("%.1f dBm")}, CellRange::rssi},
    {kVoxLinkErrorRate, {"LTE Error Rate", computed, real("%.2f%%")}, percent},
};
constexpr ValueRow nrRows[] = {
    {kVoxLinkRSRP,
     {"NR RSRP", computed, real("%.1f dBm"), {.clause = "3GPP TS 38.215 5.1.1"}},
     CellRange::rsrp},
    {kVoxLinkRSRQ,
     {"NR RSRQ", computed, real("%.1f dB"), {.clause = "3GPP TS 38.215 5.1.3"}},
     CellRange::rsrq},
    {kVoxLinkSINR,
     {"NR SINR", computed, real("%.1f dB"), {.clause = "3GPP TS 38.215 5.1.5"}},
     CellRange::sinr},
    {kVoxLinkErrorRate, {"NR Error Rate", computed, real("%.2f%%")}, percent},
};
constexpr ValueRow cdmaRows[] = {
    {kVoxLinkRSSI, {"CDMA RSSI", computed, real("%.1f dBm")}, CellRange::rssi},
    {kVoxLinkECIO, {"CDMA Ec-Io", computed, real("%.1f dB")}, CellRange::pilot},
    {kVoxLinkErrorRate, {"CDMA Error Rate", computed, real("%.2f%%")}, percent},
};
constexpr ValueRow evdoRows[] = {
    {kVoxLinkRSSI, {"EV-DO RSSI", computed, real("%.1f dBm")}, CellRange::rssi},
    {kVoxLinkECIO, {"EV-DO Ec-Io", computed, real("%.1f dB")}, CellRange::pilot},
    {kVoxLinkSINR, {"EV-DO SINR", computed, real("%.1f dB")}, CellRange::sinr},
    {kVoxLinkIO, {"EV-DO Io", computed, real("%.1f dBm")}, CellRange::rssi},
    {kVoxLinkErrorRate, {"EV-DO Error Rate", computed, real("%.2f%%")}, percent},
};

/// The dictionaries of the radio technologies.
struct LinkTable {
    std::string_view key;
    std::span<const ValueRow> rows;
};
constexpr LinkTable linkTables[] = {
    {kVoxLinkNR, nrRows},   {kVoxLinkLTE, lteRows},   {kVoxLinkUMTS, umtsRows},
    {kVoxLinkGSM, gsmRows}, {kVoxLinkCDMA, cdmaRows}, {kVoxLinkEVDO, evdoRows},
};

} // namespace

std::span<const View> ModemLink::views() const {
    return linkViews;
}

void ModemLink::show(const Dictionary& message, FieldVisitor& visitor) const {
    visitValues(message, linkRows, visitor);
    for (const LinkTable& table : linkTables)
        visitValues(dictionaryOf(message[table.key]), table.rows, visitor);
}

void ModemLink::describeShown(ContentVisitor& visitor) const {
    describeValues(linkRows, visitor);
    for (const LinkTable& table : linkTables)
        describeValues(table.rows, visitor);
}

} // namespace velmora

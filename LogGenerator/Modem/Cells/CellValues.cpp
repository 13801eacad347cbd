// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/Cells/CellValues.h"

#include "LogGenerator/Modem/Bands/GSMBands.h"
#include "LogGenerator/Modem/Bands/LTEBands.h"
#include "LogGenerator/Modem/Bands/NRBands.h"
#include "LogGenerator/Modem/Bands/TDSCDMABands.h"
#include "LogGenerator/Modem/Bands/UMTSBands.h"
#include "LogMessages/LiveModem.h"
#include "Platform/TelephonyService.h"

#include <string>

namespace velmora::LiveModem {

namespace {

const Value& valueOf(const ReportedCell& cell, const CellRow& row) {
    return (*cell.values)[row.key];
}

void showIfAny(const std::optional<std::string>& text, const CellRow& row, FieldVisitor& visitor) {
    if (text)
        visitor.text(row.field, *text);
}

/// What modems report as an unknown identity, in 32 bits, even where more are possible.
bool isUnknownIdentity(std::int64_t identity) {
    return identity == 0x7FFFFFFF || identity == 0xFFFFFFFF;
}

std::optional<std::int64_t> cellIdentity(const ReportedCell& cell, const CellRow& row) {
    Range range = CellRange::identity28;
    if (cell.technology == RadioTechnology::GSM || cell.technology == RadioTechnology::CDMA2000)
        range = CellRange::identity16;
    else if (cell.technology == RadioTechnology::NR)
        range = CellRange::identity36;
    const auto identity = wholeNumberOf(valueOf(cell, row), range);
    return identity && !isUnknownIdentity(*identity) ? identity : std::nullopt;
}

/// The bits of the cell's identity from `shift` on, `width` of them.
void showPart(const ReportedCell& cell, const CellRow& row, unsigned shift, unsigned width,
              FieldVisitor& visitor) {
    if (const auto identity = cellIdentity(cell, row))
        visitor.number(row.field, *identity >> shift & ((std::int64_t{1} << width) - 1));
}

bool hasRNC(const ReportedCell& cell, const CellRow& row) {
    return cellIdentity(cell, row).value_or(0) > 0xFFFF;
}

std::optional<std::int64_t> timingAdvance(const ReportedCell& cell, const CellRow& row) {
    switch (cell.technology) {
    case RadioTechnology::GSM: return wholeNumberOf(valueOf(cell, row), CellRange::timingAdvanceGSM);
    case RadioTechnology::LTE: return wholeNumberOf(valueOf(cell, row), CellRange::timingAdvanceLTE);
    default: return wholeNumberOf(valueOf(cell, row), CellRange::timingAdvanceNR);
    }
}

/// What the cell's channel number tells; nothing where it has none.
Bands::Carrier carrierOf(const ReportedCell& cell) {
    const auto channel = [&cell](std::string_view key, const Range& range) {
        return wholeNumberOf((*cell.values)[key], range).value_or(-1);
    };
    switch (cell.technology) {
    case RadioTechnology::GSM: return Bands::carrierOfARFCN(channel(kVoxCellMonitorARFCN, CellRange::arfcn));
    case RadioTechnology::UMTS:
        return Bands::carrierOfUARFCN(channel(kVoxCellMonitorUARFCN, CellRange::uarfcn));
    case RadioTechnology::TDSCDMA:
        return Bands::carrierOfTDDUARFCN(channel(kVoxCellMonitorUARFCN, CellRange::uarfcn));
    case RadioTechnology::LTE:
        return Bands::carrierOfEARFCN(channel(kVoxCellMonitorEARFCN, CellRange::earfcn));
    case RadioTechnology::NR:
        return Bands::carrierOfNRARFCN(channel(kVoxCellMonitorNRARFCN, CellRange::nrarfcn));
    case RadioTechnology::CDMA2000: break;
    }
    return {};
}

void showFrequency(const ReportedCell& cell, const CellRow& row, const std::optional<double>& ofChannel_MHz,
                   FieldVisitor& visitor) {
    if (ofChannel_MHz)
        visitor.real(row.field, *ofChannel_MHz);
    else if (const auto kHz = numberOf(valueOf(cell, row), CellRange::frequency_kHz))
        visitor.real(row.field, *kHz / 1000);
}

constexpr double speedOfLight = 299'792'458;                  // m/s
constexpr double bitPeriod = 48.0 / 13 * 1e-6;                // s; 3GPP TS 45.010 5.1
constexpr double timeUnit = 1 / (15'000.0 * 2048);            // s; T_s of 3GPP TS 36.211 4
constexpr double timeUnitsPerStep = 16;                       // 3GPP TS 36.213 4.2.3
constexpr double metresPerBit = speedOfLight / 2 * bitPeriod; // there and back
constexpr double metresPerStep = speedOfLight / 2 * timeUnitsPerStep * timeUnit;

} // namespace

void showInteger(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    if (const auto number = wholeNumberOf(valueOf(cell, row), row.range))
        visitor.number(row.field, *number);
}

void showReal(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    if (const auto number = numberOf(valueOf(cell, row), row.range))
        visitor.real(row.field, *number);
}

void showMegahertz(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    if (const auto number = numberOf(valueOf(cell, row), row.range))
        visitor.real(row.field, *number / 1000);
}

void showTechnology(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    visitor.number(row.field, static_cast<std::int64_t>(cell.technology));
}

void showPlace(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    if (cell.isPlace)
        visitor.number(row.field, 1);
}

void showNetwork(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    showIfAny(networkOf(*cell.values).text(), row, visitor);
}

void showCountryCode(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    showIfAny(networkOf(*cell.values).countryCode, row, visitor);
}

void showNetworkCode(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    showIfAny(networkOf(*cell.values).networkCode, row, visitor);
}

void showCellIdentity(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    if (const auto identity = cellIdentity(cell, row))
        visitor.real(row.field, static_cast<double>(*identity));
}

void showRNC(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    if (hasRNC(cell, row))
        showPart(cell, row, 16, 12, visitor);
}

void showCellOfRNC(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    if (hasRNC(cell, row))
        showPart(cell, row, 0, 16, visitor);
}

void showENB(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    showPart(cell, row, 8, 20, visitor);
}

void showSector(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    showPart(cell, row, 0, 8, visitor);
}

void showGNB(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    showPart(cell, row, 12, 24, visitor);
}

void showCellOfGNB(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    showPart(cell, row, 0, 12, visitor);
}

void showTrackingArea(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    const auto area =
        wholeNumberOf(valueOf(cell, row), cell.technology == RadioTechnology::NR ? CellRange::trackingArea
                                                                                 : CellRange::locationArea);
    // Modems report the reserved values of 16 bits as unknown in 5GS too.
    if (area && *area != 0xFFFE && *area != 0xFFFF)
        visitor.number(row.field, *area);
}

void showPhysicalCell(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    if (const auto number = wholeNumberOf(valueOf(cell, row), cell.technology == RadioTechnology::NR
                                                                  ? CellRange::physicalCellNR
                                                                  : CellRange::physicalCellLTE))
        visitor.number(row.field, *number);
}

void showColourCodes(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    if (const auto bsic = wholeNumberOf(valueOf(cell, row), row.range))
        visitor.text(row.field, std::to_string(*bsic >> 3) + "-" + std::to_string(*bsic & 7));
}

void showBands(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    const Bands::Carrier carrier = carrierOf(cell);
    std::string text;
    for (const Bands::CarrierBand& band : carrier.bands())
        text.append(text.empty() ? "" : ", ").append(band.name);
    if (!text.empty())
        visitor.text(row.field, text);
}

void showOverlappingBands(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    const Bands::Carrier carrier = carrierOf(cell);
    std::string text;
    for (const std::string_view band : carrier.overlapping())
        text.append(text.empty() ? "" : ", ").append(band);
    if (!text.empty())
        visitor.text(row.field, text);
}

void showDownlink(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    showFrequency(cell, row, carrierOf(cell).downlink_MHz(), visitor);
}

void showUplink(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    showFrequency(cell, row, carrierOf(cell).uplink_MHz(), visitor);
}

void showTimingAdvance(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    if (const auto number = timingAdvance(cell, row))
        visitor.number(row.field, *number);
}

void showDistance(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor) {
    const double metres = cell.technology == RadioTechnology::GSM ? metresPerBit : metresPerStep;
    if (const auto number = timingAdvance(cell, row))
        visitor.real(row.field, static_cast<double>(*number) * metres);
}

} // namespace velmora::LiveModem

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/Cells/ReportedCell.h"

#include "LogGenerator/Modem/Cells/CellRanges.h"
#include "LogMessages/LiveModem.h"
#include "Platform/TelephonyService.h"

#include <algorithm>

namespace velmora::LiveModem {

namespace {

constexpr std::size_t countryCodeDigits = 3;

std::optional<RadioTechnology> technologyOf(const Dictionary& cell) {
    static constexpr struct {
        std::string_view text;
        RadioTechnology technology;
    } rows[] = {
        {kVoxCellMonitorRadioAccessTechnologyGSM, RadioTechnology::GSM},
        {kVoxCellMonitorRadioAccessTechnologyUMTS, RadioTechnology::UMTS},
        {kVoxCellMonitorRadioAccessTechnologyUTRAN, RadioTechnology::TDSCDMA},
        {kVoxCellMonitorRadioAccessTechnologyLTE, RadioTechnology::LTE},
        {kVoxCellMonitorRadioAccessTechnologyNR, RadioTechnology::NR},
        {kVoxCellMonitorRadioAccessTechnologyCDMA, RadioTechnology::CDMA2000},
    };
    const std::string* const text = cell[kVoxCellMonitorCellRadioAccessTechnology].asString();
    for (const auto& row : rows)
        if (text && *text == row.text)
            return row.technology;
    return std::nullopt;
}

std::string withLeadingZeros(std::int64_t number, std::size_t digits) {
    std::string text = std::to_string(number);
    text.insert(0, digits - std::min(digits, text.size()), '0');
    return text;
}

} // namespace

std::optional<double> ReportedCell::level() const {
    if (isPlace)
        return std::nullopt;
    switch (technology) {
    case RadioTechnology::GSM: return numberOf((*values)[kVoxCellMonitorRSSI], CellRange::rxlev);
    case RadioTechnology::UMTS:
    case RadioTechnology::TDSCDMA: return numberOf((*values)[kVoxCellMonitorRSCP], CellRange::rscp);
    case RadioTechnology::LTE:
    case RadioTechnology::NR: return numberOf((*values)[kVoxCellMonitorRSRP], CellRange::rsrp);
    case RadioTechnology::CDMA2000: break;
    }
    return std::nullopt;
}

ReportedCells cellsOf(const Dictionary& message) {
    const Array& all = arrayIn(message, kVoxCellMonitorCells);
    ReportedCells cells;
    cells.count = all.size();
    for (const Value& each : all) {
        const Dictionary& values = dictionaryOf(each);
        const auto technology = technologyOf(values);
        const std::string* const type = values[kVoxCellMonitorCellType].asString();
        if (!technology || !type)
            continue;
        const bool* const isPlace = values[kVoxCellMonitorIsPlace].asBoolean();
        const ReportedCell cell{&values, *technology, isPlace && *isPlace};
        if (*type == kVoxCellMonitorCellTypeServing)
            cells.serving.push_back(cell);
        else if (*type == kVoxCellMonitorCellTypeNeighbor)
            cells.neighbors.push_back(cell);
    }
    return cells;
}

std::optional<std::string> Network::text() const {
    if (!countryCode || !networkCode)
        return std::nullopt;
    return *countryCode + "-" + *networkCode;
}

Network networkOf(const Dictionary& cell) {
    Network network;
    if (const auto number = wholeNumberOf(cell[kVoxCellMonitorMCC], CellRange::countryCode))
        network.countryCode = withLeadingZeros(*number, countryCodeDigits);
    if (const auto number = wholeNumberOf(cell[kVoxCellMonitorMNC], CellRange::networkCode)) {
        const auto digits = wholeNumberOf(cell[kVoxCellMonitorMNCDigits], CellRange::networkCodeDigits);
        network.networkCode = withLeadingZeros(*number, static_cast<std::size_t>(digits.value_or(2)));
    }
    return network;
}

std::optional<std::string> networkText(const Value& digits) {
    const std::string* const text = digits.asString();
    const auto isDigit = [](char c) { return c >= '0' && c <= '9'; };
    if (!text || text->size() < countryCodeDigits + 2 || text->size() > countryCodeDigits + 3 ||
        !std::all_of(text->begin(), text->end(), isDigit))
        return std::nullopt;
    return text->substr(0, countryCodeDigits) + "-" + text->substr(countryCodeDigits);
}

} // namespace velmora::LiveModem

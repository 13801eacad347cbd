// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Extra/CellInfoArray.h"

#include "LogMessages/LogMessage.h"
#include "Platform/SystemLog.h"
#include "Platform/TelephonyService.h"
#include "PropertyLists/PropertyList.h"

#include <cmath>
#include <limits>

namespace velmora {

namespace {

bool holds(const Dictionary& cell, std::string_view key, std::string_view text) {
    const std::string* value = cell[key].asString();
    return value && *value == text;
}

} // namespace

CellInfoArrayReader::CellInfoArrayReader(const Data& record) {
    if (Result<Value> payload =
            readPropertyList(record.from(LogMessage::headerLength).bytes(), messageLimits))
        _parsed = *std::move(payload);
    else
        logLine(LogPriority::Error, "Cell Info Array data could not be constructed");
}

const Array* CellInfoArrayReader::cells() const {
    const Array* cells = _parsed.asArray();
    if (!cells)
        logLine(LogPriority::Error, "Failed to get Cell Array\n");
    return cells;
}

bool isCell(const Value& cell, std::string_view technology, std::string_view type) {
    const Dictionary* fields = cell.asDictionary();
    return fields && holds(*fields, kVoxCellMonitorCellRadioAccessTechnology, technology) &&
           holds(*fields, kVoxCellMonitorCellType, type);
}

std::optional<std::int32_t> cellNumber(const Dictionary& cell, std::string_view key) {
    const Value& value = cell[key];
    if (const std::int64_t* integer = value.asInteger()) {
        if (*integer < std::numeric_limits<std::int32_t>::min() ||
            *integer > std::numeric_limits<std::int32_t>::max())
            return std::nullopt;
        return static_cast<std::int32_t>(*integer);
    }
    if (const double* real = value.asReal()) {
        // The comparison is false for a value that is not a number.
        if (!(*real >= std::numeric_limits<std::int32_t>::min() &&
              *real <= std::numeric_limits<std::int32_t>::max()) ||
            *real != std::trunc(*real))
            return std::nullopt;
        return static_cast<std::int32_t>(*real);
    }
    return std::nullopt;
}

} // namespace velmora

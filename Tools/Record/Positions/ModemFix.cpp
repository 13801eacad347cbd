// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Record/Positions/ModemFix.h"

#include "LogMessages/LiveModem.h"
#include "LogMessages/LogMessage.h"
#include "PropertyLists/PropertyList.h"

#include <cmath>
#include <string_view>

namespace velmora {

namespace {

std::optional<double> realOf(const Dictionary& account, std::string_view key, double limit) {
    const Value value = account[key];
    std::optional<double> number;
    if (const double* const real = value.asReal())
        number = *real;
    else if (const std::int64_t* const integer = value.asInteger())
        number = static_cast<double>(*integer);
    return number && std::abs(*number) <= limit ? number : std::nullopt;
}

} // namespace

std::optional<Fix> fixOfModemMessage(Bytes message, Time arrival) {
    const std::optional<LogMessage> parsed = LogMessage::parse(message);
    if (!parsed || parsed->logCode() != LiveModemCode::position ||
        parsed->record.size() < LogMessage::headerLength)
        return std::nullopt;
    const Result<Value> list = readPropertyList(parsed->record.subspan(LogMessage::headerLength), {});
    const Dictionary* const account = list ? list->asDictionary() : nullptr;
    if (!account)
        return std::nullopt;
    const auto latitude = realOf(*account, kVoxPositionLatitude, 90);
    const auto longitude = realOf(*account, kVoxPositionLongitude, 180);
    if (!latitude || !longitude)
        return std::nullopt;
    Fix fix;
    fix.time = arrival;
    fix.latitude = *latitude;
    fix.longitude = *longitude == 180 ? -180 : *longitude;
    fix.altitude_m = realOf(*account, kVoxPositionAltitude, 100'000);
    return fix;
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/Reports/PositionReport.h"

#include "LogMessages/LiveModem.h"
#include "Telephony/ModemManager/Bus/ModemManagerNames.h"
#include "Telephony/ModemManager/Members/MemberTable.h"
#include "Telephony/ModemManager/Reports/ModemState.h"

#include <algorithm>
#include <charconv>
#include <optional>
#include <string>
#include <vector>

namespace velmora {
namespace {

std::optional<double> realOf(std::string_view text) {
    double real = 0;
    const char* end = text.data() + text.size();
    const auto [stop, error] = std::from_chars(text.data(), end, real, std::chars_format::fixed);
    return error == std::errc() && stop == end ? std::optional(real) : std::nullopt;
}

/// "4916.45" and "N": degrees, minutes of two digits and their fraction, and the hemisphere.
std::optional<double> degreesOf(std::string_view angle, std::string_view hemisphere) {
    constexpr std::size_t minuteDigits = 2;
    constexpr double minutesOfDegree = 60;
    const std::size_t whole = std::min(angle.find('.'), angle.size());
    if (whole <= minuteDigits || hemisphere.size() != 1)
        return std::nullopt;
    const auto degrees = realOf(angle.substr(0, whole - minuteDigits));
    const auto minutes = realOf(angle.substr(whole - minuteDigits));
    const bool negative = hemisphere == "S" || hemisphere == "W";
    if (!degrees || !minutes || *minutes >= minutesOfDegree ||
        (!negative && hemisphere != "N" && hemisphere != "E"))
        return std::nullopt;
    const double angleOf = *degrees + *minutes / minutesOfDegree;
    return negative ? -angleOf : angleOf;
}

/// The fields of "$...*hh"; empty where the sentence is malformed or its checksum wrong.
std::vector<std::string_view> fieldsOf(std::string_view sentence) {
    const std::size_t star = sentence.find('*');
    if (!sentence.starts_with('$') || star == sentence.npos || sentence.size() - star < 3)
        return {};
    const std::string_view sum = sentence.substr(star + 1, 2);
    unsigned given = 0;
    const auto [stop, error] = std::from_chars(sum.data(), sum.data() + sum.size(), given, 16);
    std::string_view body = sentence.substr(1, star - 1);
    unsigned computed = 0;
    for (const char each : body)
        computed ^= static_cast<unsigned char>(each);
    if (error != std::errc() || stop != sum.data() + sum.size() || given != computed)
        return {};
    std::vector<std::string_view> fields;
    for (std::size_t comma = body.find(','); comma != body.npos; comma = body.find(',')) {
        fields.push_back(body.substr(0, comma));
        body.remove_prefix(comma + 1);
    }
    fields.push_back(body);
    return fields;
}

/// Where the fields of a kind of sentence lie; `fix` is the one that says whether there is a fix.
struct SentenceKind {
    std::string_view name; ///< after the two letters of the talker
    std::size_t fields;    ///< at least
    std::size_t fix;
    std::string_view noFix;
    std::size_t angles; ///< latitude, hemisphere, longitude, hemisphere
    std::size_t altitude;
};
constexpr SentenceKind kinds[] = {{"GGA", 10, 6, "0", 2, 9}, {"RMC", 10, 2, "V", 3, 0}};

Dictionary positionOf(const std::vector<std::string_view>& fields, const SentenceKind& kind) {
    if (fields.size() < kind.fields || fields[0].size() != 5 || fields[0].substr(2) != kind.name ||
        fields[kind.fix].empty() || fields[kind.fix] == kind.noFix)
        return {};
    const auto latitude = degreesOf(fields[kind.angles], fields[kind.angles + 1]);
    const auto longitude = degreesOf(fields[kind.angles + 2], fields[kind.angles + 3]);
    if (!latitude || !longitude)
        return {};
    Dictionary members{{"utc-time", fields[1]}, {"latitude", *latitude}, {"longitude", *longitude}};
    if (const auto altitude = kind.altitude ? realOf(fields[kind.altitude]) : std::nullopt)
        members.set("altitude", *altitude);
    return members;
}

} // namespace

Dictionary positionOfSentences(std::string_view sentences) {
    for (const SentenceKind& kind : kinds) {
        std::string_view rest = sentences;
        while (!rest.empty()) {
            const std::size_t end = std::min(rest.find_first_of("\r\n"), rest.size());
            if (Dictionary members = positionOf(fieldsOf(rest.substr(0, end)), kind); !members.empty())
                return members;
            rest.remove_prefix(std::min(end + 1, rest.size()));
        }
    }
    return {};
}

bool hasPosition(const Modem& modem) {
    const std::int64_t* enabled = modem[mm::location]["Enabled"].asInteger();
    return enabled && (*enabled & mm::satelliteBits) != 0;
}

DictionaryRef positionReportOf(const Value& location, const Modem& modem, std::string_view reason) {
    DictionaryRef root = rootOf(modem, reason);
    const Dictionary* sources = location.asDictionary();
    if (!sources || !hasPosition(modem))
        return root;
    if (const Dictionary* receiver = (*sources)[mm::satelliteLocationKey].asDictionary())
        setKeys(*root, MemberUse::Position, MemberOf::Satellites, *receiver);
    else if (const std::string* sentences = (*sources)[mm::sentencesKey].asString())
        setKeys(*root, MemberUse::Position, MemberOf::Satellites, positionOfSentences(*sentences));
    // A time or a height alone is no position.
    if (!root->contains(kVoxPositionLatitude) || !root->contains(kVoxPositionLongitude))
        return rootOf(modem, reason);
    return root;
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/Observations/PhysicalValue.h"

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <optional>

namespace velmora {

namespace {

/// The number after the prefix, or none.
std::optional<double> shownNumber(std::string_view prefix, const std::string& text) {
    if (!text.starts_with(prefix))
        return std::nullopt;
    const char* const begin = text.c_str() + prefix.size();
    char* end = nullptr;
    // It reads hexadecimal digits after "0x", too.
    const double number = std::strtod(begin, &end);
    return end == begin ? std::nullopt : std::optional(number);
}

/// What 1 of the shown unit is in the observed one.
double unitScale(const Field& field) {
    // The display's kilobit has 1024 bits, the observed one 1000.
    return field.format.format.suffix == " kbps" && !field.means.unit ? 1.024 : 1;
}

/// The difference between a shown number and the value that its rounding allows.
double tolerance(const Field& field, double value) {
    const bool isReal = field.format.kind == TextFormat::Kind::Real;
    const double rounding = isReal ? 0.5 * std::pow(10, -field.format.format.precision) : 0;
    return rounding * std::fabs(field.means.scale) * unitScale(field) + 1e-9 * std::fabs(value) + 1e-9;
}

std::string ofField(const Observation& observation, const Field& field, const std::string& text) {
    std::optional<double> number = shownNumber(field.format.format.prefix, text);
    if (!number)
        return "a number whose text is \"" + text + "\"";
    const double range = std::ldexp(1, field.place.width);
    if (field.means.sign == Sign::Signed && *number >= range / 2)
        *number -= range;
    if (field.means.sign == Sign::Unsigned && *number < 0)
        *number += range;
    const double expected = *number * field.means.scale * unitScale(field) + field.means.offset;
    if (!(std::fabs(observation.number - expected) <= tolerance(field, expected)))
        return "\"" + text + "\" means " + std::to_string(expected) + ", observed as " +
               std::to_string(observation.number);
    return {};
}

std::string ofNumber(const Observation& observation, const std::string& text) {
    if (observation.source && !observation.leaf->isReadFromText &&
        observation.text != Observation::Text::Given)
        return ofField(observation, *observation.source->field, text);
    const std::optional<double> number = shownNumber("", text);
    if (!number || std::fabs(*number - observation.number) > 1e-6 * (1 + std::fabs(*number)))
        return "\"" + text + "\" is observed as " + std::to_string(observation.number);
    if (!observation.leaf->isReadFromText)
        return {};
    // A known leaf's unit may come from its meaning, without being shown.
    const std::string unit(observation.source
                               ? observation.source->field->format.format.suffix.substr(
                                     observation.source->field->format.format.suffix.empty() ? 0 : 1)
                               : nameOf(observation.leaf->unit));
    if (unit.empty() ? text.find(' ') != std::string::npos : !text.ends_with(" " + unit))
        return "\"" + text + "\" is observed in the unit \"" + unit + "\"";
    return {};
}

std::string ofText(const Observation& observation, const std::string& text) {
    const std::string words(observation.words);
    const std::uint8_t digits = observation.source ? observation.source->field->means.digits : 0;
    if (digits == 0)
        return words == text ? "" : "the words \"" + words + "\" show \"" + text + "\"";
    if (words.size() < digits || words.find_first_not_of("0123456789") != std::string::npos)
        return "the code \"" + words + "\"";
    return std::atoi(words.c_str()) == std::atoi(text.c_str()) ? "" : words + " shows \"" + text + "\"";
}

std::string ofAbsence(const Observation& observation, const std::string& text) {
    const std::vector<std::string>& texts = observation.leaf->absentTexts;
    if (std::find(texts.begin(), texts.end(), text) != texts.end() || observation.leaf->isReadFromText)
        return {};
    if (text == "nan" || text == "-nan" || text == "inf" || text == "-inf")
        return {}; // as supplied
    // Texts without end: what is not finite, the reason with a number, and what are no digits.
    if (observation.text == Observation::Text::OfReal && !std::isfinite(observation.shown))
        return {};
    if (observation.source &&
        (observation.source->field->means.isAbsence || observation.source->field->means.digits != 0))
        return {};
    return "\"" + text + "\" is none of the leaf's texts for an absent value";
}

} // namespace

std::string contradiction(const Observation& observation, const std::string& text) {
    switch (observation.kind) {
    case ObservedKind::Number: return ofNumber(observation, text);
    case ObservedKind::Text: return ofText(observation, text);
    case ObservedKind::Absent: return ofAbsence(observation, text);
    case ObservedKind::Enumeration:
    case ObservedKind::Flag:
    case ObservedKind::Binary: break;
    }
    return {};
}

} // namespace velmora

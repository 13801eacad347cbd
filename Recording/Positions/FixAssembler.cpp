// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Positions/FixAssembler.h"

#include "Platform/TimeSpan.h"
#include "Recording/Positions/NMEAValues.h"

#include <cmath>
#include <utility>

namespace velmora {

namespace {

constexpr double metresPerSecondOfKnot = 1852.0 / 3600.0;
constexpr double metresPerSecondOfKilometresPerHour = 1.0 / 3.6;
constexpr double fullCircle = 360;

/// Which field has the time of day; none for kinds without.
std::optional<std::size_t> timeField(std::string_view kind) {
    if (kind == "GGA" || kind == "GNS" || kind == "RMC" || kind == "GST" || kind == "ZDA")
        return 0;
    if (kind == "GLL")
        return 4;
    return std::nullopt;
}

/// The dilution that receivers report without a fix is 99.99 or so.
std::optional<double> dilution(std::string_view text) {
    constexpr double unknown = 99;
    const std::optional<double> value = nmea::magnitude(text);
    return value && *value > 0 && *value < unknown ? value : std::nullopt;
}

std::optional<double> course(std::string_view text) {
    const std::optional<double> value = nmea::magnitude(text);
    return value && *value <= fullCircle ? std::optional(std::fmod(*value, fullCircle)) : std::nullopt;
}

std::optional<double> scaled(std::optional<double> value, double factor) {
    return value ? std::optional(*value * factor) : std::nullopt;
}

/// Replaces a value only by another.
void set(std::optional<double>& value, std::optional<double> other) {
    if (other)
        value = other;
}

} // namespace

std::optional<Fix> FixAssembler::add(const PositionSentence& text) {
    ++_sentences;
    const std::optional<NMEASentence> sentence = NMEASentence::parse(text.text);
    if (!sentence) {
        ++_damaged;
        return std::nullopt;
    }
    const std::string_view kind = sentence->kind();
    const std::optional<std::size_t> at = timeField(kind);
    const auto timeOfDay = at ? nmea::timeOfDay(sentence->field(*at)) : std::nullopt;
    std::optional<Fix> complete = completeAt(text.time);
    if (timeOfDay && _epoch.timeOfDay && *timeOfDay != *_epoch.timeOfDay)
        complete = finish();
    if (!std::exchange(_epoch.isBegun, true))
        _epoch.first = text.time;
    if (timeOfDay)
        _epoch.timeOfDay = timeOfDay;
    if (kind == "GGA")
        addGGA(*sentence, text.time);
    else if (kind == "GNS")
        addGNS(*sentence, text.time);
    else if (kind == "RMC")
        addRMC(*sentence, text.time);
    else if (kind == "GLL")
        addGLL(*sentence, text.time);
    else if (kind == "GST")
        addGST(*sentence);
    else if (kind == "VTG")
        addVTG(*sentence);
    else if (kind == "GSA")
        addGSA(*sentence);
    return complete;
}

std::optional<Fix> FixAssembler::completeAt(Time now) {
    // A clock that was set back ends it as well.
    if (!_epoch.isBegun || (now >= _epoch.first && timeSpan(_epoch.first, now) <= longestEpoch))
        return std::nullopt;
    return finish();
}

std::optional<Fix> FixAssembler::finish() {
    const Epoch epoch = std::exchange(_epoch, {});
    _epochs += epoch.isBegun ? 1 : 0;
    return epoch.hasPosition && !epoch.isInvalid ? std::optional(epoch.fix) : std::nullopt;
}

std::optional<Time> FixAssembler::pending() const {
    return _epoch.hasPosition && !_epoch.isInvalid ? std::optional(_epoch.fix.time) : std::nullopt;
}

void FixAssembler::addGGA(const NMEASentence& sentence, Time time) {
    if (const auto quality = nmea::magnitude(sentence.field(5)); !quality || *quality == 0) {
        _epoch.isInvalid = true;
        return;
    }
    addPosition(sentence, 1, time, true);
    set(_epoch.fix.hdop, dilution(sentence.field(7)));
    if (sentence.field(9) == "M")
        set(_epoch.fix.altitude_m, nmea::number(sentence.field(8)));
}

void FixAssembler::addGNS(const NMEASentence& sentence, Time time) {
    // A letter for each system: N where it has no fix.
    if (sentence.field(5).find_first_not_of('N') == std::string_view::npos) {
        _epoch.isInvalid = true;
        return;
    }
    addPosition(sentence, 1, time, true);
    set(_epoch.fix.hdop, dilution(sentence.field(7)));
    set(_epoch.fix.altitude_m, nmea::number(sentence.field(8)));
}

void FixAssembler::addRMC(const NMEASentence& sentence, Time time) {
    if (sentence.field(1) != "A" || sentence.field(11) == "N") {
        _epoch.isInvalid = true;
        return;
    }
    addPosition(sentence, 2, time, false);
    set(_epoch.fix.speed_mps, scaled(nmea::magnitude(sentence.field(6)), metresPerSecondOfKnot));
    set(_epoch.fix.course_degrees, course(sentence.field(7)));
}

void FixAssembler::addGLL(const NMEASentence& sentence, Time time) {
    if (sentence.field(5) != "A" || sentence.field(6) == "N") {
        _epoch.isInvalid = true;
        return;
    }
    addPosition(sentence, 0, time, false);
}

void FixAssembler::addGST(const NMEASentence& sentence) {
    const auto latitude = nmea::magnitude(sentence.field(5));
    const auto longitude = nmea::magnitude(sentence.field(6));
    if (latitude && longitude)
        _epoch.fix.deviation_m = std::hypot(*latitude, *longitude);
}

void FixAssembler::addVTG(const NMEASentence& sentence) {
    if (sentence.field(8) == "N")
        return;
    set(_epoch.fix.course_degrees, course(sentence.field(0)));
    if (sentence.field(5) == "N")
        set(_epoch.fix.speed_mps, scaled(nmea::magnitude(sentence.field(4)), metresPerSecondOfKnot));
    else if (sentence.field(7) == "K")
        set(_epoch.fix.speed_mps,
            scaled(nmea::magnitude(sentence.field(6)), metresPerSecondOfKilometresPerHour));
}

void FixAssembler::addGSA(const NMEASentence& sentence) {
    set(_epoch.fix.hdop, dilution(sentence.field(15)));
}

void FixAssembler::addPosition(const NMEASentence& sentence, std::size_t at, Time time, bool isBest) {
    const auto latitude = nmea::latitude(sentence.field(at), sentence.field(at + 1));
    const auto longitude = nmea::longitude(sentence.field(at + 2), sentence.field(at + 3));
    if (!latitude || !longitude)
        return;
    if (!_epoch.hasPosition)
        _epoch.fix.time = time;
    // GGA has the finer one where a receiver writes them differently.
    if (!_epoch.hasPosition || (isBest && !_epoch.isOfBest)) {
        _epoch.fix.latitude = *latitude;
        _epoch.fix.longitude = *longitude;
        _epoch.isOfBest = isBest;
    }
    _epoch.hasPosition = true;
}

} // namespace velmora

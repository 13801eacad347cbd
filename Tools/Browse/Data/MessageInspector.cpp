// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Data/MessageInspector.h"

#include "LogGenerator/C2K/OneX/SubPackets.h"
#include "LogMessages/LogMessage.h"
#include "LogMessages/Record.h"
#include "Platform/PrintableText.h"
#include "Playback/QuietDecoding.h"

#include <algorithm>
#include <set>
#include <string_view>
#include <unordered_set>
#include <utility>

namespace velmora {

namespace {

/// Messages before the one that is taken apart, so that what is old can be recognized: some 10 seconds.
constexpr std::uint64_t lead = 256;

/// In unsigned numbers, since a damaged file may have any times.
bool isLongBefore(Time earlier, Time later) {
    const auto age = static_cast<std::uint64_t>(later.time_since_epoch().count()) -
                     static_cast<std::uint64_t>(earlier.time_since_epoch().count());
    constexpr std::chrono::nanoseconds old = MessageInspector::oldAge;
    return earlier < later && age > static_cast<std::uint64_t>(old.count());
}

/// Where a record or its sub-packet of that id, 0 for none, begins in the message.
std::optional<std::size_t> beginOfTable(const LogMessage& message, std::uint8_t subPacket) {
    const std::size_t begin = message.prefixed ? LogMessage::prefixLength : 0;
    if (subPacket == 0)
        return begin;
    if (message.record.size() < C2K::SubPackets::minimumLength)
        return std::nullopt;
    const C2K::FoundSubPacket found = C2K::SubPackets(Record(message.record)).find(subPacket);
    return found.found() ? std::optional(begin + found.offset) : std::nullopt;
}

} // namespace

bool MessageInspector::begin(std::uint64_t position) {
    const Result<bool> isNew = _decoder.standBefore(position, lead);
    if (!isNew)
        _failure = isNew.reason();
    else if (*isNew)
        _latest.clear();
    return static_cast<bool>(isNew);
}

bool MessageInspector::takeNext() {
    std::optional<LoggedMessage> message = _cursor.at(_decoder->messages());
    if (!message) {
        _failure = _cursor.failure();
        return false;
    }
    if (_isWanted) {
        _inspected.message = *message;
        _inspected.message.message = Data::copyOf(message->message.bytes()); // the reader's chunk is large
        message->message = _inspected.message.message;
    }
    _decoder->take(*message);
    return true;
}

const InspectedMessage* MessageInspector::inspect(std::uint64_t position) {
    if (_hasInspected && _inspected.position == position)
        return &_inspected;
    const QuietDecoding quiet;
    _hasInspected = false;
    _failure.clear();
    if (!begin(position))
        return nullptr;
    _isWanted = false;
    while (_decoder->messages() < position)
        if (!takeNext())
            return nullptr;
    const std::vector<DisplayRow> before = displayRows(_decoder->display());
    _inspected = {};
    _inspected.position = position;
    _isWanted = true;
    const bool isTaken = takeNext();
    _isWanted = false;
    if (!isTaken)
        return nullptr;
    _probed.find(_inspected.message, _inspected.fields);
    _inspected.rows = displayRows(_decoder->display());
    markChanges(_inspected.rows, before);
    addAges();
    _hasInspected = true;
    return &_inspected;
}

void MessageInspector::observed(const ObservedMessage& message) {
    for (const Observation& each : message.observations) {
        if (each.leaf->index >= _latest.size())
            _latest.resize(each.leaf->index + 1, Time::min());
        _latest[each.leaf->index] = message.arrival;
    }
    if (!_isWanted)
        return;
    std::set<std::string> sections;
    for (const Observation& each : message.observations)
        sections.insert(each.leaf->section);
    const FieldPlaces places(_decoder->decoder(), _inspected.message.message, sections);
    for (const Observation& each : message.observations) {
        ReportedField field;
        each.appendPath(field.path);
        field.text = printable(_text.of(each));
        field.place = placeOf(each, places);
        _inspected.fields.push_back(std::move(field));
    }
}

std::optional<FieldPlace> MessageInspector::placeOf(const Observation& observation,
                                                    const FieldPlaces& places) const {
    if (!observation.source || !observation.source->field || observation.source->field->place.isComputed())
        return std::nullopt;
    const Bytes bytes = _inspected.message.message.bytes();
    const Place& place = observation.source->field->place;
    std::optional<std::size_t> begin = places.find(*observation.source->field, observation.rows);
    if (const auto parsed = LogMessage::parse(bytes); parsed && !begin && !observation.source->list)
        begin = beginOfTable(*parsed, observation.source->subPacket);
    if (!begin || *begin + place.end() > bytes.size())
        return std::nullopt;
    return FieldPlace{*begin + place.offset, *begin + place.end(), place.bit, place.width};
}

void MessageInspector::addAges() {
    std::unordered_set<std::string_view> reported;
    for (const ReportedField& field : _inspected.fields)
        reported.insert(field.path);
    const Catalogue& catalogue = _decoder->decoder().catalogue();
    const Time now = _inspected.message.time;
    for (DisplayRow& row : _inspected.rows) {
        if (row.isBranch)
            continue;
        row.isReported = reported.contains(row.path);
        const CatalogueField* const leaf = leafOfPath(catalogue, row.path);
        if (!leaf)
            continue;
        const bool isKnown = leaf->index < _latest.size() && _latest[leaf->index] != Time::min();
        if (isKnown)
            row.latest = _latest[leaf->index];
        const Time latest = row.latest.value_or(_decoder.beginning());
        row.isOld = isLongBefore(latest, now);
    }
}

} // namespace velmora

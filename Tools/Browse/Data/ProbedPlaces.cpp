// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Data/ProbedPlaces.h"

#include "LogMessages/LogMessage.h"

#include <algorithm>
#include <bit>
#include <functional>
#include <string_view>
#include <utility>

namespace velmora {

namespace {

/// What is decoded for one message, in bytes: some 20 ms.
constexpr std::size_t mostWork = std::size_t{8} << 20;

std::uint64_t mixed(std::uint64_t hash, std::uint64_t value) {
    return (std::rotl(hash, 5) ^ value) * 0x9E3779B97F4A7C15;
}

std::uint64_t mixed(std::uint64_t hash, std::string_view text) {
    return mixed(hash, std::hash<std::string_view>()(text));
}

std::string_view textOf(Bytes bytes) {
    return {reinterpret_cast<const char*>(bytes.data()), bytes.size()};
}

std::uint64_t placeIn(const Observation& each) {
    std::uint64_t hash = each.leaf->index;
    for (const std::uint32_t row : each.rows)
        hash = mixed(hash, row);
    return hash;
}

std::uint64_t valueOf(const Observation& each) {
    std::uint64_t hash = static_cast<std::uint64_t>(each.kind);
    hash = mixed(hash, std::bit_cast<std::uint64_t>(each.number));
    hash = mixed(hash, std::bit_cast<std::uint64_t>(each.shown));
    hash = mixed(hash, static_cast<std::uint64_t>(each.raw));
    hash = mixed(hash, each.words);
    hash = mixed(hash, each.given);
    return mixed(hash, textOf(each.bytes));
}

/// What can be changed of a message.
std::vector<ChangedBytes> changesOf(Bytes message) {
    const std::optional<LogMessage> parsed = LogMessage::parse(message);
    std::size_t begin = 0;
    if (const bool isBareList = message.empty() || message[0] == '<' || message[0] == 'b'; !isBareList) {
        if (!parsed || parsed->payload().empty())
            return {};
        begin = message.size() - parsed->payload().size();
    }
    const std::size_t most = mostWork / message.size();
    std::vector<ChangedBytes> changes;
    if (begin == 0 || parsed->type == LogMessage::extraType) {
        changes = listScalars(message.subspan(begin), most);
        for (ChangedBytes& each : changes) {
            each.begin += begin;
            each.end += begin;
        }
    } else if (message.size() - begin <= most) {
        constexpr std::uint8_t bits = 0x15; // some low ones and some high ones
        for (std::size_t i = begin; i < message.size(); ++i)
            changes.push_back({i, i + 1, {static_cast<std::uint8_t>(message[i] ^ bits)}});
    }
    return changes;
}

} // namespace

ProbedPlaces::~ProbedPlaces() {
    if (_decoder)
        _decoder->decoder().setObservationSink(nullptr);
}

void ProbedPlaces::observed(const ObservedMessage& message) {
    _isWhole = message.damage == Damage::None;
    for (const Observation& each : message.observations) {
        _reported.push_back({placeIn(each), valueOf(each)});
        if (!_paths)
            continue;
        std::string path;
        each.appendPath(path);
        _paths->try_emplace(std::move(path), _reported.back().place);
    }
}

bool ProbedPlaces::decode(const LoggedMessage& message) {
    _reported.clear();
    _isWhole = false;
    _decoder->take(message);
    return _isWhole;
}

void ProbedPlaces::probe(const LoggedMessage& message, const ChangedBytes& change) {
    const Bytes bytes = message.message.bytes();
    const auto at = [&bytes](std::size_t offset) {
        return bytes.begin() + static_cast<std::ptrdiff_t>(offset);
    };
    std::vector<std::uint8_t> changed(bytes.begin(), at(change.begin));
    changed.insert(changed.end(), change.others.begin(), change.others.end());
    changed.insert(changed.end(), at(change.end), bytes.end());
    LoggedMessage copy = message;
    copy.message = Data::copyOf(changed);
    if (!decode(copy))
        return;
    enum class Outcome : std::uint8_t { Gone, Changed, Same };
    std::vector<Outcome> outcomes(_unchanged.size(), Outcome::Gone);
    for (const Reported& each : _reported)
        if (const auto found = _indexes.find(each.place); found != _indexes.end())
            outcomes[found->second] =
                _unchanged[found->second].value == each.value ? Outcome::Same : Outcome::Changed;
    // A number that names the row takes the row away; what changes its value is nearer to it.
    const auto affected = static_cast<std::size_t>(
        std::count_if(outcomes.begin(), outcomes.end(), [](Outcome each) { return each != Outcome::Same; }));
    for (std::size_t i = 0; i < outcomes.size(); ++i)
        if (outcomes[i] != Outcome::Same)
            take(change, i, 2 * affected + (outcomes[i] == Outcome::Gone ? 1 : 0));
}

void ProbedPlaces::take(const ChangedBytes& change, std::size_t index, std::size_t effect) {
    Nearest& nearest = _nearest[index];
    if (nearest.effect == effect && nearest.end == change.begin)
        nearest.end = change.end; // the next byte of a number
    else if (nearest.effect == 0 || effect <= nearest.effect)
        nearest = {effect, change.begin, change.end};
}

void ProbedPlaces::find(const LoggedMessage& message, std::span<ReportedField> fields) {
    const auto isUnknown = [](const ReportedField& field) { return !field.place; };
    if (std::none_of(fields.begin(), fields.end(), isUnknown))
        return;
    const std::vector<ChangedBytes> changes = changesOf(message.message.bytes());
    if (changes.empty())
        return;
    if (!_decoder) {
        Result<std::unique_ptr<PlayedDecoder>> decoder = PlayedDecoder::make(_technology, {});
        if (!decoder)
            return;
        _decoder = *std::move(decoder);
        _decoder->decoder().setObservationSink(this);
    }
    std::map<std::string, std::uint64_t> paths;
    _paths = &paths;
    const bool isWhole = decode(message);
    _paths = nullptr;
    if (!isWhole)
        return;
    _unchanged = _reported;
    _indexes.clear();
    for (std::size_t i = 0; i < _unchanged.size(); ++i)
        _indexes.try_emplace(_unchanged[i].place, i);
    // What depends on earlier messages as well is reported otherwise the second time.
    static_cast<void>(decode(message));
    std::vector<bool> isSteady(_unchanged.size());
    for (const Reported& each : _reported)
        if (const auto found = _indexes.find(each.place); found != _indexes.end())
            isSteady[found->second] = _unchanged[found->second].value == each.value;
    _nearest.assign(_unchanged.size(), {});
    for (const ChangedBytes& change : changes)
        probe(message, change);
    for (ReportedField& field : fields) {
        const auto path = field.place ? paths.end() : paths.find(field.path);
        if (path == paths.end())
            continue;
        const std::size_t index = _indexes.at(path->second);
        const Nearest& nearest = _nearest[index];
        if (isSteady[index] && nearest.effect > 0)
            field.place = FieldPlace{nearest.begin, nearest.end, 0, 0};
    }
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Rows/KeptRow.h"

#include <algorithm>
#include <bit>
#include <charconv>
#include <optional>
#include <system_error>

namespace velmora {

namespace {

constexpr std::size_t wordBits = 64;

/// The number of a list's row at the front of a path, as the tree writes it; what follows is left.
std::optional<std::size_t> takeRow(std::string_view& path) {
    const std::string_view digits = path.substr(1, path.find('/', 1) - 1);
    std::size_t row = 0;
    const auto [end, error] = std::from_chars(digits.data(), digits.data() + digits.size(), row);
    if (error != std::errc() || std::to_string(row) != digits)
        return std::nullopt;
    path.remove_prefix(1 + digits.size());
    return row;
}

} // namespace

std::string_view KeptRow::cells(Dictionary& state) {
    const Value display = _decoder.display(state);
    const bool isSame = !display.isNone() && display.asDictionary() == _display.asDictionary();
    if (!isSame) {
        _display = display;
        resolve(_decoder.changingPlaces(state));
    }
    if (!_isKept) {
        _fresh.clear();
        _cells.appendAll(_fresh, display, _selection);
        return _fresh.view();
    }
    if (findStale())
        makeStaleCells();
    return _row;
}

void KeptRow::resolve(const std::vector<ChangingPlace>& places) {
    _sources.clear();
    _columns.clear();
    _ends.clear();
    _row.clear();
    _isKept = !places.empty();
    if (!_isKept)
        return;
    const std::size_t count = _selection.paths().size();
    const Mask none((count + wordBits - 1) / wordBits);
    _stale = none;
    for (const ChangingPlace& place : places)
        _sources.push_back({place.changes, *place.changes, none});
    for (std::size_t i = 0; i < count; ++i) {
        const std::string_view path = _selection.paths()[i];
        Column& column = _columns.emplace_back(
            Column{ColumnPlace(path, _display, places), path, NodeSelection::hasWildcard(path)});
        if (column.place.isSingle() && !column.hasWildcard)
            setSteps(column);
        for (const std::size_t place : column.place.places())
            _sources[place].columns[i / wordBits] |= std::uint64_t{1} << i % wordBits;
        _row += ',';
        _ends.push_back(_row.size());
        _stale[i / wordBits] |= std::uint64_t{1} << i % wordBits;
    }
    makeStaleCells();
    std::erase_if(_sources, [&none](const Source& each) { return each.columns == none; });
}

void KeptRow::setSteps(Column& column) {
    std::string_view rest = column.place.rest();
    if (rest.empty())
        return;
    if (column.place.start().asArray())
        column.row = takeRow(rest);
    // A path of several labels may lead in several ways, since labels may have slashes.
    column.hasSteps = rest.empty() || (rest.size() > 1 && rest.find('/', 1) == rest.npos);
    if (!rest.empty())
        column.label = rest.substr(1);
}

bool KeptRow::findStale() {
    bool isStale = false;
    for (Source& source : _sources) {
        if (source.seen == *source.changes)
            continue;
        source.seen = *source.changes;
        isStale = true;
        for (std::size_t i = 0; i < _stale.size(); ++i)
            _stale[i] |= source.columns[i];
    }
    return isStale;
}

void KeptRow::makeStaleCells() {
    std::size_t copied = 0;   // of the row, into the next one
    std::size_t adjusted = 0; // the ends of so many columns are those in the next one
    bool isChanging = false;
    std::size_t gained = 0; // wraps around where the row gets shorter
    const auto adjustTo = [&](std::size_t column) {
        for (; adjusted < column; ++adjusted)
            _ends[adjusted] += gained;
    };
    for (std::size_t word = 0; word < _stale.size(); ++word) {
        for (std::uint64_t left = _stale[word]; left != 0; left &= left - 1) {
            const std::size_t i = word * wordBits + static_cast<std::size_t>(std::countr_zero(left));
            _cell.clear();
            appendCell(_columns[i]);
            const std::string_view text = _cell.view();
            const std::size_t begin = (i == 0 ? 0 : _ends[i - 1]) + 1; // after the comma
            const std::size_t size = _ends[i] - begin;
            if (text.size() == size) {
                text.copy(_row.data() + begin, size);
                continue;
            }
            if (!isChanging)
                _next.clear();
            isChanging = true;
            adjustTo(i);
            _next.append(_row, copied, begin - copied).append(text);
            copied = begin + size;
            gained += text.size() - size;
        }
        _stale[word] = 0;
    }
    if (!isChanging)
        return;
    adjustTo(_ends.size());
    _next.append(_row, copied);
    _row.swap(_next);
}

void KeptRow::appendCell(Column& column) {
    if (!column.place.isSingle()) {
        _cells.append(_cell, _display, column.path);
        return;
    }
    const Value& start = column.place.start();
    if (column.place.rest().empty())
        _cells.append(_cell, &start);
    else if (!column.hasSteps || !appendBySteps(column, start))
        _cells.appendBelow(_cell, start, column.place.rest(), column.hasWildcard);
}

bool KeptRow::appendBySteps(Column& column, const Value& start) {
    const Value* value = &start;
    if (const Array* const list = start.asArray(); list && column.row) {
        if (*column.row >= list->size())
            return true;
        value = &(*list)[*column.row];
    } else if (list || column.row) {
        return false;
    }
    if (column.label.empty()) {
        _cells.append(_cell, value);
        return true;
    }
    const Dictionary* const fields = value->asDictionary();
    // Where the keys are sorted by what they begin with, they are no labels.
    if (!fields || fields->contains(sortedMarker))
        return false;
    const auto at = [fields](std::size_t index) {
        return fields->begin() + static_cast<std::ptrdiff_t>(index);
    };
    if (column.index >= fields->size() || at(column.index)->key != column.label)
        column.index = static_cast<std::size_t>(
            std::find_if(fields->begin(), fields->end(),
                         [&column](const Dictionary::Entry& each) { return each.key == column.label; }) -
            fields->begin());
    if (column.index < fields->size())
        _cells.append(_cell, &at(column.index)->value);
    return true;
}

} // namespace velmora

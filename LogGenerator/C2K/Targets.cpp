// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/Targets.h"

#include <algorithm>
#include <limits>
#include <utility>

namespace velmora::C2K {

namespace {

/// For kept keys; a multiple of what the parsers have, so that few places are asked for by two.
constexpr std::size_t places = 256;
/// With so many all are forgotten, so that an empty place is never far. The parsers have a few dozen.
constexpr std::size_t mostKeys = places / 2;

bool isSameConstant(std::string_view a, std::string_view b) {
    return a.data() == b.data() && a.size() == b.size();
}

} // namespace

void Targets::use(const DictionaryRef& lookup) {
    const bool isKnown =
        lookup.get() == _lookup && !_watch.owner_before(lookup) && !lookup.owner_before(_watch);
    if (isKnown)
        return;
    _watch = lookup;
    _lookup = lookup.get();
    _foundKeys.clear();
    _keptKeys = 0;
    _foundFields.clear();
}

std::span<const Targets::Target> Targets::of(std::string_view valueKey) {
    FoundKey& found = placeOf(valueKey);
    // The bytes there may have become another key.
    if (!isSameConstant(found.constant, valueKey) || found.key != valueKey) {
        found.targets = find(valueKey);
        found.key = valueKey;
        _keptKeys += found.constant.data() == nullptr ? 1 : 0;
        found.constant = valueKey;
    }
    return found.targets;
}

/// Where the key is kept, or the empty place where it is to be: at the one that its address tells, or behind
/// it.
Targets::FoundKey& Targets::placeOf(std::string_view valueKey) {
    if (_keptKeys == mostKeys) {
        _foundKeys.clear();
        _keptKeys = 0;
    }
    if (_foundKeys.empty())
        _foundKeys.resize(places);
    const auto address = reinterpret_cast<std::uintptr_t>(valueKey.data());
    std::size_t place = (address ^ address >> 8) % places;
    while (_foundKeys[place].constant.data() != nullptr &&
           !isSameConstant(_foundKeys[place].constant, valueKey))
        place = (place + 1) % places;
    return _foundKeys[place];
}

const Targets::Screens& Targets::of(std::span<const ValueField> fields) {
    auto found = std::find_if(_foundFields.begin(), _foundFields.end(),
                              [&fields](const FoundFields& each) { return each.fields == fields.data(); });
    if (found == _foundFields.end())
        found = _foundFields.insert(found, {fields.data(), find(fields)});
    return found->screens;
}

std::vector<Targets::Target> Targets::find(std::string_view valueKey) const {
    std::vector<Target> result;
    const Value* found = _lookup ? _lookup->find(valueKey) : nullptr;
    const Array* targets = found ? found->asArray() : nullptr;
    if (!targets)
        return result;
    for (const Value& target : *targets) {
        const Dictionary* entries = target.asDictionary();
        const std::string* label = entries ? (*entries)["key"].asString() : nullptr;
        Dictionary* display = entries ? (*entries)["dict"].asDictionary() : nullptr;
        if (!label || !display || display->isFrozen())
            break;
        result.push_back({display, label});
    }
    return result;
}

Targets::Screens Targets::find(std::span<const ValueField> fields) {
    std::vector<Screen> screens;
    for (std::size_t place = 0; place < fields.size(); ++place) {
        for (const Target& target : find(fields[place].key)) {
            auto screen = std::find_if(screens.begin(), screens.end(), [&target](const Screen& each) {
                return each.display == target.display;
            });
            if (screen == screens.end())
                screen = screens.insert(screen, {target.display, {}});
            if (!LabelledFields::append(screen->labels, place, *target.label))
                return std::nullopt;
        }
    }
    return screens;
}

bool LabelledFields::append(std::vector<std::uint8_t>& bytes, std::size_t place, std::string_view label) {
    constexpr std::size_t most = std::numeric_limits<std::uint8_t>::max();
    if (place > most || label.size() > most || bytes.size() + 2 + label.size() > longest)
        return false;
    bytes.push_back(static_cast<std::uint8_t>(place));
    bytes.push_back(static_cast<std::uint8_t>(label.size()));
    bytes.insert(bytes.end(), label.begin(), label.end());
    return true;
}

LabelledFields::Entry LabelledFields::next() {
    const std::size_t place = _rest[0];
    const Bytes label = _rest.subspan(2, _rest[1]);
    _rest = _rest.subspan(2 + label.size());
    return {place, {reinterpret_cast<const char*>(label.data()), label.size()}};
}

} // namespace velmora::C2K

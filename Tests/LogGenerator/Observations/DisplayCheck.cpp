// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/Observations/DisplayCheck.h"

#include "Platform/TelephonyService.h"
#include "Tests/LogGenerator/Observations/PhysicalValue.h"

namespace velmora {

namespace {

bool isOfNumberedList(const CatalogueSource* source) {
    return source && source->list && source->list->entries == List::Entries::Numbered;
}

std::string joined(const std::vector<std::size_t>& numbers) {
    std::string text;
    for (const std::size_t number : numbers)
        text += " " + std::to_string(number);
    return text;
}

} // namespace

DisplayCheck::DisplayCheck(LogGenerator& decoder)
    : _decoder(decoder), _isDictionaryOfValues(decoder.technology() == kVoxLogChannelTechnology_Ostrel_CDMA) {
    _decoder.setObservationSink(this);
}

DisplayCheck::~DisplayCheck() {
    _decoder.setObservationSink(nullptr);
}

void DisplayCheck::mark(Dictionary& state) {
    const Value display = _decoder.display(state);
    if (_decoder.catalogue().readsNumbersFromTexts()) { // each message is an entire display
        _marked.clear();
        for (const auto& [path, leaf] : ShownDisplay(display, _decoder.catalogue(), false).leaves)
            _marked[path] = leaf.pattern;
    } else {
        markDisplay(display, _decoder.catalogue());
        _marked = ShownDisplay(display, _decoder.catalogue(), _isDictionaryOfValues).marked;
    }
    _seen.clear();
    _lists.clear();
    _removed.clear();
    _problems.clear();
}

void DisplayCheck::observed(const ObservedMessage& message) {
    ObservedText made;
    for (const Observation& each : message.observations) {
        std::string path;
        each.appendPath(path);
        const std::string text(made.of(each));
        if (const std::string reason = contradiction(each, text); !reason.empty())
            _problems.push_back(path + ": " + reason);
        _seen[path].push_back({text, std::string(each.rowKey), each.leaf, each.source});
        _leaves.insert(each.leaf);
        if (each.source)
            _sources.insert(each.source);
    }
    for (const ObservedList& list : message.lists)
        _lists[list.list->path()].push_back(list.rows);
    for (const CatalogueField* const leaf : message.removed)
        _removed.insert(leaf->path);
}

std::vector<std::string> DisplayCheck::problems(Dictionary& state) {
    const ShownDisplay shown(_decoder.display(state), _decoder.catalogue(), _isDictionaryOfValues);
    if (shown.isAmbiguous)
        return {};
    expectShown(shown);
    expectObserved(shown);
    expectLists(shown);
    expectRowKeys(shown);
    expectRemoved(shown);
    return std::move(_problems);
}

void DisplayCheck::expectShown(const ShownDisplay& shown) {
    for (const auto& [path, seen] : _seen) {
        const auto found = shown.leaves.find(path);
        if (found == shown.leaves.end()) {
            if (!_removed.contains(path))
                _problems.push_back(path + " is observed and not shown: " + seen.back().text);
            continue;
        }
        std::vector<std::string> texts;
        for (const Seen& each : seen)
            texts.push_back(each.text);
        // A field that a record has several times shows the last; entries of one number are all shown.
        if (found->second.texts.size() == 1 && !isOfNumberedList(seen.back().source))
            texts.erase(texts.begin(), texts.end() - 1);
        if (texts != found->second.texts)
            _problems.push_back(path + " is observed as \"" + texts.back() + "\" and shows \"" +
                                found->second.texts.back() + "\"");
    }
}

void DisplayCheck::expectObserved(const ShownDisplay& shown) {
    for (const auto& [path, leaf] : shown.leaves) {
        const auto found = _seen.find(path);
        if (found == _seen.end())
            _problems.push_back(path + " shows \"" + leaf.texts.back() + "\" and is not observed");
        else if (found->second.back().leaf->path != leaf.pattern)
            _problems.push_back(path + " is " + found->second.back().leaf->path + " in the catalogue");
    }
}

void DisplayCheck::expectLists(const ShownDisplay& shown) {
    for (const auto& [pattern, sizes] : shown.lists)
        if (const auto found = _lists.find(pattern);
            found == _lists.end() ? !shown.emptyOnly.contains(pattern) : found->second != sizes)
            _problems.push_back("the list " + pattern + " has" + joined(sizes) + " entries, observed:" +
                                (found == _lists.end() ? " nothing" : joined(found->second)));
    for (const auto& [pattern, sizes] : _lists)
        if (!shown.lists.contains(pattern) && !(sizes.back() == 0 && shown.leaves.contains(pattern)))
            _problems.push_back("the list " + pattern + " is observed and not written");
}

void DisplayCheck::expectRowKeys(const ShownDisplay& shown) {
    for (const auto& [path, seen] : _seen) {
        const CatalogueSource* const source = seen.back().source;
        if (!source || !source->list || source->list->entries != List::Entries::Rows)
            continue;
        const std::string row = path.substr(0, path.size() - source->field->label.size());
        std::string key;
        for (const std::string_view label : source->list->keys)
            if (const auto found = shown.leaves.find(row + std::string(label)); found != shown.leaves.end())
                key += (key.empty() ? "" : "/") + found->second.texts.back();
        if (key != seen.back().rowKey)
            _problems.push_back(path + " has the row key \"" + seen.back().rowKey + "\", not \"" + key +
                                "\"");
    }
}

void DisplayCheck::expectRemoved(const ShownDisplay& shown) {
    for (const auto& [path, pattern] : _marked) {
        const bool isGone = !shown.marked.contains(path) && !shown.leaves.contains(path);
        // What is in a list goes with it, and a list may follow a text.
        const bool mayGo =
            pattern.find("/*") != std::string::npos || _removed.contains(path) || _lists.contains(path);
        if (isGone && !mayGo)
            _problems.push_back(path + " is gone and not reported as removed");
    }
    for (const std::string& path : _removed)
        if (shown.marked.contains(path) || (shown.leaves.contains(path) && !_seen.contains(path)))
            _problems.push_back(path + " is reported as removed and shown");
}

} // namespace velmora

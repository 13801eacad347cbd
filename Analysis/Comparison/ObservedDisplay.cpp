// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Comparison/ObservedDisplay.h"

#include <algorithm>
#include <map>
#include <span>
#include <utility>

namespace velmora {

namespace {

bool isOfNumberedList(const Observation& observation) {
    const CatalogueSource* const source = observation.source;
    return source && source->list && source->list->entries == List::Entries::Numbered;
}

/// The outermost list that the leaf is in; null for none.
const CatalogueNode* outermostList(const CatalogueField& leaf) {
    const CatalogueNode* list = nullptr;
    for (const CatalogueNode* node = leaf.node; node; node = node->parent())
        if (node->isRow())
            list = node;
    return list;
}

/// How many of the rows that lead to the leaf are inside the one that a key identifies.
std::size_t rowsBelowKey(const CatalogueField& leaf) {
    std::size_t rows = 0;
    for (const CatalogueNode* node = leaf.node; node; node = node->parent()) {
        if (!node->keys().empty())
            return rows;
        rows += node->isRow() ? 1 : 0;
    }
    return 0; // the number of an entry is the key of the innermost row
}

/// The rows' numbers, and the key in place of the one of the row that it identifies.
std::string rowText(const CatalogueField& leaf, std::span<const std::uint32_t> rows, std::string_view key) {
    const std::size_t keyed =
        key.empty() ? rows.size() : rows.size() - 1 - std::min(rows.size() - 1, rowsBelowKey(leaf));
    std::string text;
    for (std::size_t i = 0; i < rows.size(); ++i) {
        text += i > 0 ? "/" : "";
        text += i == keyed ? std::string(key) : std::to_string(rows[i]);
    }
    return text;
}

} // namespace

bool ShownValue::isSame(const ShownValue& other) const {
    if (kind != other.kind)
        return false;
    switch (kind) {
    case ObservedKind::Number: return number == other.number;
    case ObservedKind::Enumeration:
    case ObservedKind::Flag: return raw == other.raw;
    case ObservedKind::Text:
    case ObservedKind::Binary: return words == other.words;
    case ObservedKind::Absent: break;
    }
    return text == other.text;
}

void ObservedDisplay::update(const ObservedMessage& message) {
    for (const ObservedList& each : message.lists)
        removeAll(*each.list);
    for (const CatalogueField* const leaf : message.removed)
        remove(*leaf);
    for (const Observation& each : message.observations)
        add(each);
}

void ObservedDisplay::removeAll(const CatalogueNode& list) {
    if (list.leaf())
        remove(*list.leaf());
    for (const auto& child : list.children())
        removeAll(*child);
}

void ObservedDisplay::remove(const CatalogueField& leaf) {
    if (leaf.index < _values.size())
        _values[leaf.index].clear();
}

ObservedDisplay::Kept::Kept(const Observation& kept)
    : observation(kept), rows(kept.rows.begin(), kept.rows.end()), rowKey(kept.rowKey), words(kept.words),
      given(kept.given), bytes(kept.bytes.begin(), kept.bytes.end()) {}

void ObservedDisplay::add(const Observation& observation) {
    const std::size_t leaf = observation.leaf->index;
    if (leaf >= _values.size())
        _values.resize(leaf + 1);
    std::vector<Kept>& values = _values[leaf];
    // Of a field that a record has several times the last is shown; entries of one number all are.
    if (!isOfNumberedList(observation))
        std::erase_if(values, [&](const Kept& each) {
            return std::equal(each.rows.begin(), each.rows.end(), observation.rows.begin(),
                              observation.rows.end());
        });
    values.emplace_back(observation);
}

ShownValue ObservedDisplay::shown(const Kept& kept, ObservedText& texts) {
    Observation observation = kept.observation;
    observation.words = kept.words;
    observation.given = kept.given;
    const bool isBinary = observation.kind == ObservedKind::Binary;
    return {observation.leaf,
            observation.kind,
            observation.number,
            observation.raw,
            isBinary ? kept.bytes : kept.words,
            std::string(texts.of(observation)),
            kept.rows.empty() ? std::string() : rowText(*observation.leaf, kept.rows, kept.rowKey),
            kept.rows,
            observation.leaf->index};
}

std::vector<ShownValue> ObservedDisplay::values() const {
    struct Sorted {
        const std::vector<std::uint32_t>* rows;
        ShownValue value;
    };
    ObservedText texts;
    std::vector<Sorted> sorted;
    std::map<const CatalogueNode*, std::size_t> groups; // by list
    for (const std::vector<Kept>& kept : _values) {
        std::map<std::string, std::size_t> rows; // how many have the same identity
        for (const Kept& each : kept) {
            ShownValue value = shown(each, texts);
            if (const CatalogueNode* const list = outermostList(*value.leaf); list && !each.rows.empty()) {
                value.group = groups.try_emplace(list, value.leaf->index).first->second;
                if (const std::size_t count = ++rows[value.row]; count > 1)
                    value.row += " #" + std::to_string(count);
            }
            sorted.push_back({&each.rows, std::move(value)});
        }
    }
    std::stable_sort(sorted.begin(), sorted.end(), [](const Sorted& a, const Sorted& b) {
        return a.value.group != b.value.group ? a.value.group < b.value.group
               : a.rows->empty()              ? !b.rows->empty()
                                              : !b.rows->empty() && a.rows->front() < b.rows->front();
    });
    std::vector<ShownValue> values;
    values.reserve(sorted.size());
    for (Sorted& each : sorted)
        values.push_back(std::move(each.value));
    return values;
}

} // namespace velmora

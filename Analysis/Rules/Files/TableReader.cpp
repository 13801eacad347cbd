// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Files/TableReader.h"

#include "Analysis/Rules/Expression/InputNames.h"
#include "Analysis/Rules/Expression/RuleUnit.h"
#include "Platform/PrintableText.h"

#include <algorithm>
#include <chrono>
#include <string>

namespace velmora {

namespace {

constexpr std::chrono::duration<double> longestSpan = std::chrono::hours(24);

std::string inQuotes(std::string_view key) {
    return printableLine(key.substr(0, 64));
}

} // namespace

TableReader::TableReader(const TOMLNode& table, std::span<const std::string_view> keys, FileErrors& errors)
    : _table(table), _errors(errors) {
    for (const TOMLNode::Entry& each : table.entries)
        if (std::find(keys.begin(), keys.end(), each.key) == keys.end())
            errors.add(each.position, "got the key " + inQuotes(each.key) + ", wanted one like " +
                                          nearestNames(each.key.substr(0, 64), keys));
}

const TOMLNode* TableReader::find(std::string_view key, TOMLNode::Kind kind) {
    const TOMLNode* const node = _table.find(key);
    if (!node || node->kind == kind)
        return node;
    _errors.add(node->position, "got " + std::string(nameOf(node->kind)) + " for " + std::string(key) +
                                    ", wanted " + std::string(nameOf(kind)));
    return nullptr;
}

const TOMLNode* TableReader::require(std::string_view key, TOMLNode::Kind kind) {
    if (!has(key))
        _errors.add(_table.position, "got no " + std::string(key) + ", wanted " + std::string(nameOf(kind)));
    return find(key, kind);
}

std::optional<Time::duration> TableReader::findSpan(std::string_view key) {
    const TOMLNode* const node = _table.find(key);
    return node ? spanOf(*node, _errors) : std::nullopt;
}

std::optional<Time::duration> spanOf(const TOMLNode& node, FileErrors& errors) {
    std::optional<double> seconds;
    if (node.kind == TOMLNode::Kind::Number)
        seconds = node.number;
    else if (node.kind == TOMLNode::Kind::Text)
        seconds = readSpan(node.text);
    if (!seconds || !(*seconds >= 0) || *seconds > longestSpan.count()) {
        const std::string got = node.kind == TOMLNode::Kind::Text ? inQuotes(node.text)
                                : node.kind == TOMLNode::Kind::Number
                                    ? numberWithUnit(node.number, Unit::None)
                                    : std::string(nameOf(node.kind));
        errors.add(node.position,
                   "got " + got +
                       ", wanted a number of seconds or a text as in \"5s\", \"2 min\", at most 24 h");
        return std::nullopt;
    }
    return std::chrono::duration_cast<Time::duration>(std::chrono::duration<double>(*seconds));
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Observations/PathPattern.h"

#include <algorithm>
#include <charconv>
#include <numeric>

namespace velmora {

namespace {

using Node = Catalogue::Node;

constexpr std::size_t mostNearest = 3;

/// The row's number at the front of what is left of a path; `rest` is what is left after it.
std::optional<std::uint32_t> takeRow(std::string_view& rest) {
    std::uint32_t row = 0;
    const char* const end = rest.data() + rest.size();
    const auto [after, error] = std::from_chars(rest.data() + 1, end, row);
    const std::string_view digits = rest.substr(1, static_cast<std::size_t>(after - rest.data()) - 1);
    if (error != std::errc() || (after != end && *after != '/') || (digits.size() > 1 && digits[0] == '0'))
        return std::nullopt;
    rest.remove_prefix(digits.size() + 1);
    return row;
}

/// Whether the path leads along these nodes, to the last of them or one above it.
bool leadsAlong(std::string_view rest, std::span<const Node* const> nodes, bool atRoot,
                PathPattern::Rows& rows) {
    if (rest.empty()) {
        for (const Node* const node : nodes)
            if (node->isRow())
                rows.emplace_back();
        return true;
    }
    if (nodes.empty())
        return false;
    const std::size_t earlierRows = rows.size();
    if (const auto left = PathPattern::after(rest, atRoot, nodes[0]->name())) {
        if (nodes[0]->isRow())
            rows.emplace_back();
        if (leadsAlong(*left, nodes.subspan(1), false, rows))
            return true;
        rows.resize(earlierRows);
    }
    if (!nodes[0]->isRow() || !rest.starts_with('/'))
        return false;
    const std::optional<std::uint32_t> row = takeRow(rest);
    if (!row)
        return false;
    rows.emplace_back(row);
    return leadsAlong(rest, nodes.subspan(1), false, rows);
}

bool leadsInto(std::string_view rest, const Node& node, bool atRoot) {
    if (rest.empty() || node.isOpen())
        return true;
    for (const auto& child : node.children()) {
        if (const auto left = PathPattern::after(rest, atRoot, child->name());
            left && leadsInto(*left, *child, false))
            return true;
        std::string_view inRow = rest;
        if (child->isRow() && rest.starts_with('/') && takeRow(inRow) && leadsInto(inRow, *child, false))
            return true;
    }
    return false;
}

void collectPaths(const Node& node, std::vector<std::string>& paths) {
    for (const auto& child : node.children()) {
        paths.push_back(child->path());
        collectPaths(*child, paths);
    }
}

} // namespace

std::optional<std::string_view> PathPattern::after(std::string_view path, bool atRoot,
                                                   std::string_view name) {
    const std::string_view slashes = atRoot && name.empty() ? "//" : "/";
    if (!path.starts_with(slashes))
        return std::nullopt;
    const auto isEnd = [](std::string_view rest) { return rest.empty() || rest.front() == '/'; };
    if (path.starts_with("/*") && isEnd(path.substr(2)))
        return path.substr(2);
    path.remove_prefix(slashes.size());
    // A slash in the name looks like one between names.
    if (!path.starts_with(name))
        return std::nullopt;
    path.remove_prefix(name.size());
    return isEnd(path) ? std::optional(path) : std::nullopt;
}

std::optional<std::string_view> PathPattern::below(std::string_view path, const CatalogueNode& place) {
    if (!place.parent() || path == "/")
        return path == "/" ? std::string_view() : path;
    const std::optional<std::string_view> above = below(path, *place.parent());
    if (!above || above->empty())
        return above;
    return after(*above, !place.parent()->parent(), place.name());
}

std::optional<PathPattern::Rows> PathPattern::select(const CatalogueField& leaf) const {
    std::vector<const Node*> nodes;
    for (const Node* node = leaf.node; node->parent(); node = node->parent())
        nodes.push_back(node);
    std::reverse(nodes.begin(), nodes.end());
    Rows rows;
    const std::string_view rest = _text == "/" ? std::string_view() : std::string_view(_text);
    return leadsAlong(rest, nodes, true, rows) ? std::optional(std::move(rows)) : std::nullopt;
}

bool PathPattern::isPossible(const Catalogue& catalogue) const {
    return _text == "/" || leadsInto(_text, catalogue.root(), true);
}

bool isInRows(const Observation& observation, const PathPattern::Rows& rows) {
    for (std::size_t i = 0; i < rows.size(); ++i)
        if (rows[i] && (i >= observation.rows.size() || observation.rows[i] != *rows[i]))
            return false;
    return true;
}

std::size_t editDistance(std::string_view a, std::string_view b) {
    std::vector<std::size_t> row(b.size() + 1);
    std::iota(row.begin(), row.end(), std::size_t{0});
    for (std::size_t i = 0; i < a.size(); ++i) {
        std::size_t diagonal = row[0];
        row[0] = i + 1;
        for (std::size_t j = 0; j < b.size(); ++j) {
            const std::size_t replaced = diagonal + (a[i] == b[j] ? 0 : 1);
            diagonal = row[j + 1];
            row[j + 1] = std::min({replaced, row[j] + 1, row[j + 1] + 1});
        }
    }
    return row.back();
}

std::vector<std::string> nearestPaths(std::span<const Catalogue* const> catalogues, std::string_view path) {
    std::vector<std::string> paths;
    for (const Catalogue* const catalogue : catalogues)
        collectPaths(catalogue->root(), paths);
    std::vector<std::pair<std::size_t, std::size_t>> ranks;
    for (std::size_t i = 0; i < paths.size(); ++i)
        ranks.emplace_back(editDistance(path, paths[i]), i);
    std::sort(ranks.begin(), ranks.end());
    std::vector<std::string> nearest;
    for (const auto& [far, index] : ranks)
        if (nearest.size() < mostNearest &&
            std::find(nearest.begin(), nearest.end(), paths[index]) == nearest.end())
            nearest.push_back(paths[index]);
    return nearest;
}

} // namespace velmora

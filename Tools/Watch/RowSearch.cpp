// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Watch/RowSearch.h"

#include <algorithm>

namespace velmora {

namespace {

std::string folded(std::string text) {
    for (char& each : text)
        if (each >= 'A' && each <= 'Z')
            each = static_cast<char>(each - 'A' + 'a');
    return text;
}

bool has(const TreeRow& row, const std::string& foldedText) {
    return folded(row.text).find(foldedText) != std::string::npos;
}

std::size_t indentOf(const TreeRow& row) {
    return std::min(row.text.find_first_not_of(' '), row.text.size());
}

template <class IsFound>
std::optional<std::size_t> find(const std::vector<TreeRow>& rows, std::size_t from, SearchDirection direction,
                                IsFound isFound) {
    if (direction == SearchDirection::Forward) {
        for (std::size_t i = from + 1; i < rows.size(); ++i)
            if (isFound(rows[i]))
                return i;
        return std::nullopt;
    }
    for (std::size_t i = std::min(from, rows.size()); i > 0; --i)
        if (isFound(rows[i - 1]))
            return i - 1;
    return std::nullopt;
}

} // namespace

std::optional<std::size_t> findRow(const std::vector<TreeRow>& rows, const std::string& text,
                                   std::size_t from, SearchDirection direction) {
    const std::string wanted = folded(text);
    return find(rows, from, direction, [&wanted](const TreeRow& row) { return has(row, wanted); });
}

std::optional<std::size_t> findBranch(const std::vector<TreeRow>& rows, std::size_t from,
                                      SearchDirection direction) {
    return find(rows, from, direction, [](const TreeRow& row) { return row.isBranch; });
}

std::vector<TreeRow> rowsWith(const std::vector<TreeRow>& rows, const std::string& text) {
    const std::string wanted = folded(text);
    std::vector<TreeRow> found;
    std::vector<const TreeRow*> branches; // that the row is in and that are not listed yet
    constexpr std::size_t none = std::string::npos;
    std::size_t whole = none; // the indent of a branch that has the text
    for (const TreeRow& row : rows) {
        const std::size_t indent = indentOf(row);
        while (!branches.empty() && indentOf(*branches.back()) >= indent)
            branches.pop_back();
        if (whole != none && indent <= whole)
            whole = none;
        const bool isListed = whole != none || has(row, wanted);
        if (isListed) {
            for (const TreeRow* const branch : branches)
                found.push_back(*branch);
            branches.clear();
            found.push_back(row);
            if (row.isBranch && whole == none)
                whole = indent;
        } else if (row.isBranch) {
            branches.push_back(&row);
        }
    }
    return found;
}

} // namespace velmora

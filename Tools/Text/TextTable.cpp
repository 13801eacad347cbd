// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Text/TextTable.h"

#include "Platform/PrintableText.h"

#include <algorithm>
#include <utility>

namespace velmora {

void TextTable::add(std::vector<std::string> cells) {
    for (std::string& cell : cells)
        cell = printable(cell);
    _rows.push_back(std::move(cells));
}

std::string TextTable::text(std::size_t indent) const {
    std::vector<std::size_t> widths(_columns.size());
    for (const auto& row : _rows)
        for (std::size_t i = 0; i < row.size(); ++i)
            widths[i] = std::max(widths[i], displayWidth(row[i]));
    std::string text;
    for (const auto& row : _rows) {
        std::string line(indent, ' ');
        for (std::size_t i = 0; i < row.size(); ++i) {
            const std::string blanks(widths[i] - displayWidth(row[i]), ' ');
            line += i > 0 ? "  " : "";
            line += _columns[i] == Align::Left ? row[i] + blanks : blanks + row[i];
        }
        line.erase(line.find_last_not_of(' ') + 1);
        text += line + "\n";
    }
    return text;
}

} // namespace velmora

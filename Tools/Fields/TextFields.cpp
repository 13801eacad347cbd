// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Fields/TextFields.h"

#include "LogGenerator/Fields/Role.h"
#include "Platform/PrintableText.h"
#include "Tools/Fields/SourceText.h"
#include "Tools/Output.h"

#include <algorithm>
#include <array>
#include <string>

namespace velmora {

namespace {

constexpr std::size_t columns = 4;
using Cells = std::array<std::string, columns>;

Cells cellsOf(const CatalogueField& leaf) {
    std::string kind(nameOf(leaf.kind));
    if (leaf.unit != Unit::None)
        kind += " " + std::string(nameOf(leaf.unit));
    std::vector<std::string> codes;
    for (const CatalogueSource& source : leaf.sources)
        if (const std::string code = codeText(source.code);
            source.code != noCode && std::find(codes.begin(), codes.end(), code) == codes.end())
            codes.push_back(code);
    return {printable(leaf.path), kind, std::string(nameOf(leaf.role)), joinedText(codes, ", ")};
}

} // namespace

void TextFields::write(std::string_view technology, const CatalogueRows& rows) {
    if (rows.empty())
        return;
    std::vector<Cells> table;
    std::array<std::size_t, columns> widths{};
    for (const CatalogueField& leaf : rows) {
        table.push_back(cellsOf(leaf));
        for (std::size_t i = 0; i < columns; ++i)
            widths[i] = std::max(widths[i], displayWidth(table.back()[i]));
    }
    std::string text = (_isFirst ? "" : "\n") + std::string(technology) + "\n";
    _isFirst = false;
    for (const Cells& cells : table) {
        std::string line;
        for (std::size_t i = 0; i < columns; ++i)
            line += "  " + cells[i] + std::string(widths[i] - displayWidth(cells[i]), ' ');
        line.erase(line.find_last_not_of(' ') + 1);
        text += line + "\n";
    }
    _output.put(text);
}

} // namespace velmora

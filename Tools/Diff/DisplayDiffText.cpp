// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/PrintableText.h"
#include "Tools/Diff/DiffWriter.h"
#include "Tools/Stats/FigureText.h"
#include "Tools/Text/TextTable.h"

namespace velmora {

namespace {

using Align = TextTable::Align;

std::string textOf(const std::optional<ShownValue>& value) {
    if (!value)
        return "-";
    if (value->kind == ObservedKind::Number)
        return figureText(value->number, value->leaf->unit);
    return value->text.empty() ? "(empty)" : value->text;
}

std::string differenceText(const DisplayDifference& difference) {
    const std::optional<double> number = difference.difference();
    if (!number)
        return {};
    return (*number > 0 ? "+" : "") + figureText(number);
}

} // namespace

std::string displayDiffText(const std::vector<TechnologyDifferences>& technologies) {
    std::string text;
    for (const TechnologyDifferences& technology : technologies) {
        text += (text.empty() ? "" : "\n") + printable(technology.technology);
        if (!technology.isInA || !technology.isInB)
            text += technology.isInA ? ", in A alone" : ", in B alone";
        TextTable table({Align::Left, Align::Left, Align::Left, Align::Left, Align::Left, Align::Right});
        table.add({"", "field", "row", "A", "B", "B - A"});
        for (const DisplayDifference& each : technology.differences)
            table.add({std::string(nameOf(each.change())), each.any().leaf->path, each.any().row,
                       textOf(each.before), textOf(each.after), differenceText(each)});
        text += technology.differences.empty() ? ": no differences\n" : "\n" + table.text(2);
    }
    return technologies.empty() ? "no messages\n" : text;
}

} // namespace velmora

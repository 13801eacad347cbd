// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Stats/StatsText.h"

#include "Platform/PrintableText.h"
#include "Tools/Output.h"
#include "Tools/Stats/FigureText.h"
#include "Tools/Stats/GroupText.h"
#include "Tools/Stats/NumberTable.h"
#include "Tools/Text/CountText.h"

namespace velmora {

namespace {

using Align = TextTable::Align;

std::string nameOf(const LeafStatistics& leaf) {
    return leaf.name.empty() ? leaf.leaf.path : leaf.name;
}

std::string roleLines(const GroupStatistics& group, bool hasHistogram) {
    NumberTable table("role", hasHistogram);
    std::string worst;
    for (const RoleStatistics& role : rolesOf(group)) {
        table.add(std::string(nameOf(role.role)), role.unit, role.numbers, role.absent);
        if (!role.worst)
            continue;
        const bool isMean = role.measure == WorstMinute::Measure::HighestMean;
        worst += "  " + std::string(nameOf(role.role)) + ": " + minuteText(role.worst->begin) + ", " +
                 (isMean ? "mean " : "median ") + figureText(role.worst->figure, role.unit) + " of " +
                 countText(role.worst->samples) + " samples" +
                 (group.parts.size() > 1 ? " of " + role.worstTechnology : "") + "\n";
    }
    std::string text = table.isEmpty() ? std::string() : "\nroles\n" + table.text();
    return text + (worst.empty() ? "" : "\nworst minutes\n" + worst);
}

std::string stateLines(const LeafStatistics& leaf) {
    const StateCounts& states = leaf.states;
    const bool hasTime = !leaf.isInList();
    std::string text = "  " + printable(nameOf(leaf)) + ": " + countText(states.samples()) + " samples";
    if (leaf.absent != 0)
        text += ", absent in " + countText(leaf.absent);
    if (hasTime)
        text += ", known for " + secondsText(states.time()) + " s, " + countText(states.transitionCount()) +
                " transitions";
    TextTable values({Align::Right, Align::Right, Align::Right, Align::Left});
    const auto add = [&](const StateCounts::Value& value, const std::string& name) {
        values.add({hasTime ? shareText(value.time, states.time()) : "",
                    hasTime ? secondsText(value.time) + " s" : "", countText(value.samples), name});
    };
    for (const StateCounts::Value& each : states.values())
        add(each, each.text);
    if (states.hasOthers())
        add(states.at(StateCounts::others), "(others)");
    TextTable changes({Align::Right, Align::Left});
    const auto textAt = [&](std::size_t value) {
        return value == StateCounts::others ? "(others)" : states.at(value).text;
    };
    for (const auto& [change, count] : states.transitions())
        changes.add({countText(count), textAt(change.first) + " -> " + textAt(change.second)});
    return text + "\n" + values.text(4) + changes.text(6);
}

std::string partLines(const TechnologyPart& part, bool hasHistogram) {
    std::string text = "\n" + part.technology + ": " + countText(part.messages) + " messages";
    if (part.first)
        text += ", " + momentText(*part.first) + " to " + momentText(*part.last);
    text += "\n";
    if (part.omitted != 0)
        text += "  " + countText(part.omitted) + " values of further fields are left out\n";
    NumberTable table("field", hasHistogram);
    std::string states;
    for (const auto& leaf : part.leaves) {
        if (leaf && leaf->hasNumbers())
            table.add(nameOf(*leaf), leaf->leaf.unit, leaf->numbers, leaf->absent);
        if (leaf && leaf->hasStates())
            states += stateLines(*leaf);
    }
    if (!table.isEmpty())
        text += "\nnumbers\n" + table.text();
    return text + (states.empty() ? "" : "\nstates\n" + states);
}

} // namespace

void StatsText::write(const GroupStatistics& group) {
    std::string text;
    if (const std::string title = groupTitle(group, _options); !title.empty())
        text = (_isFirst ? "== " : "\n== ") + printable(title) + " ==\n";
    _isFirst = false;
    std::string body = roleLines(group, _options.hasHistogram);
    for (const auto& part : group.parts)
        body += partLines(*part, _options.hasHistogram);
    if (group.parts.empty())
        body = "\nno messages\n";
    // The first blank line is for what is above, and nothing is.
    _output.put(text + (text.empty() ? body.substr(1) : body));
    _output.flush();
}

} // namespace velmora

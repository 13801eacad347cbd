// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/Page/StatisticsPart.h"

#include "Analysis/Comparison/NamingNumber.h"
#include "Analysis/Statistics/NumberFigures.h"
#include "Export/Report/DriveReport.h"
#include "Export/Report/Page/FigureRows.h"
#include "Export/Report/Page/Markup.h"
#include "Export/Report/Page/Rows.h"

#include <algorithm>

namespace velmora {

namespace {

void writeRoles(Markup& out, const DriveReport& report) {
    FigureRows rows(out, report, report.isComparison() ? "Comparison of roles" : "Roles");
    for (const RoleName& name : roleNames()) {
        if (!hasFigures(name.role))
            continue;
        FigureRows::Row row{std::string(nameOf(name.role)), name.unit, {}, {}, {}};
        for (std::size_t i = 0; i < report.groups().size(); ++i)
            for (const RoleStatistics& role : rolesOf(*report.groups()[i]))
                if (role.role == name.role)
                    row.figures[report.groups()[i]->key.input.value_or(0)] = NumberFigures(role.numbers);
        for (const auto& technology : report.technologies())
            for (const CatalogueField& leaf : technology->catalogue().fields())
                if (leaf.role == name.role)
                    row.add(*technology, leaf);
        rows.write(row);
    }
}

void writeLeaves(Markup& out, const DriveReport& report, const TechnologyReport& technology) {
    FigureRows rows(out, report, "Numbers of " + technology.catalogue().technology());
    for (const CatalogueField& leaf : technology.catalogue().fields()) {
        if (isNamingNumber(leaf) || (isIdentifying(leaf) && !report.options().hasIdentities))
            continue;
        FigureRows::Row row{leaf.path, leaf.unit, {}, {}, {}};
        for (const auto& group : report.groups())
            for (const auto& part : group->parts)
                if (part->technology == technology.catalogue().technology())
                    if (const LeafStatistics* const known = part->find(leaf); known && known->numbers.count())
                        row.figures[group->key.input.value_or(0)] = NumberFigures(known->numbers);
        row.add(technology, leaf);
        rows.write(row);
    }
}

/// Between which messages the state was reported.
MessageRange messagesOf(const DriveReport& report, std::string_view technology, const CatalogueField& leaf,
                        std::size_t group) {
    for (const auto& each : report.technologies())
        if (each->catalogue().technology() == technology)
            return each->extremes(group).range(leaf);
    return {};
}

void writeStates(Markup& out, const DriveReport& report, const LeafStatistics& leaf, std::string_view file,
                 const MessageRange& messages) {
    const std::chrono::nanoseconds whole = leaf.states.time();
    for (const StateCounts::Value& value : leaf.states.values()) {
        out.raw("<tr>");
        writeCell(out, leaf.leaf.path);
        if (report.isComparison())
            writeCell(out, file);
        writeCell(out, value.text);
        writeNumberCell(out, pageDuration(value.time));
        writeNumberCell(out, pageShare(value.time, whole));
        writeNumberCell(out, pageCount(value.samples));
        writeRange(out, report, messages);
        out.raw("</tr>\n");
    }
}

void writeStates(Markup& out, const DriveReport& report) {
    if (report.isComparison())
        beginTable(out, "Time in states",
                   {"State", "File", "Value", "#Time", "#Share", "#Reports", "Messages"});
    else
        beginTable(out, "Time in states", {"State", "Value", "#Time", "#Share", "#Reports", "Messages"});
    for (const auto& group : report.groups())
        for (const auto& part : group->parts)
            for (const auto& leaf : part->leaves)
                if (leaf && !leaf->states.values().empty() && !leaf->isInList() &&
                    leaf->leaf.sameAs.empty() && leaf->states.time().count() != 0 &&
                    (!isIdentifying(leaf->leaf) || report.options().hasIdentities))
                    writeStates(
                        out, report, *leaf, report.inputs()[group->key.input.value_or(0)].name,
                        messagesOf(report, part->technology, leaf->leaf, group->key.input.value_or(0)));
    endTable(out);
}

} // namespace

void writeStatistics(Markup& out, const DriveReport& report) {
    out.raw("<section id=\"statistics\" aria-labelledby=\"statistics-title\"><h2 id=\"statistics-title\">");
    out.raw(report.isComparison() ? "Comparison" : "Statistics").raw("</h2>\n");
    if (!report.groups().empty()) {
        writeRoles(out, report);
        out.raw("<details><summary>All fields with numbers</summary>\n");
        for (const auto& technology : report.technologies())
            writeLeaves(out, report, *technology);
        out.raw("</details>\n<details><summary>All states</summary>\n");
        writeStates(out, report);
        out.raw("</details>\n");
    }
    out.raw("</section>\n");
}

} // namespace velmora

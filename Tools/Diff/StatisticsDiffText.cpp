// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Comparison/NamingNumber.h"
#include "Analysis/Statistics/NumberFigures.h"
#include "Platform/PrintableText.h"
#include "Tools/Diff/DiffWriter.h"
#include "Tools/Diff/StateDifferences.h"
#include "Tools/Diff/StatisticsPairs.h"
#include "Tools/Stats/FigureText.h"
#include "Tools/Stats/GroupText.h"
#include "Tools/Text/CountText.h"
#include "Tools/Text/TextTable.h"

namespace velmora {

namespace {

using Align = TextTable::Align;

/// Three rows a field: of A, of B, and their difference.
class PairTable {
public:
    explicit PairTable(const std::string& title) {
        _table.add({title, "unit", "", "samples", "minimum", "5 %", "50 %", "95 %", "maximum", "mean"});
    }

    /// Null where an input has none. `isNaming`: numbers that have no difference.
    void add(const std::string& name, Unit unit, bool isNaming, const ValueCounts* a, const ValueCounts* b) {
        const NumberFigures first = a ? NumberFigures(*a) : NumberFigures();
        const NumberFigures second = b ? NumberFigures(*b) : NumberFigures();
        _table.add(rowOf(name, std::string(nameOf(unit)), "A", first));
        _table.add(rowOf("", "", "B", second));
        _isEmpty = false;
        if (isNaming)
            return;
        std::vector<std::string> difference{"", "", "B - A", ""};
        for (const auto figure : {&NumberFigures::minimum, &NumberFigures::p5, &NumberFigures::p50,
                                  &NumberFigures::p95, &NumberFigures::maximum, &NumberFigures::mean})
            difference.push_back(differenceText(first.*figure, second.*figure));
        _table.add(std::move(difference));
    }
    [[nodiscard]] std::string text() const { return _isEmpty ? std::string() : _table.text(2); }

private:
    static std::vector<std::string> rowOf(const std::string& name, const std::string& unit, const char* side,
                                          const NumberFigures& figures) {
        return {name,
                unit,
                side,
                countText(figures.samples),
                figureText(figures.minimum),
                figureText(figures.p5),
                figureText(figures.p50),
                figureText(figures.p95),
                figureText(figures.maximum),
                figureText(figures.mean)};
    }
    static std::string differenceText(const std::optional<double>& a, const std::optional<double>& b) {
        return a && b ? (*b > *a ? "+" : "") + figureText(*b - *a) : "-";
    }

    TextTable _table{{Align::Left, Align::Left, Align::Left, Align::Right, Align::Right, Align::Right,
                      Align::Right, Align::Right, Align::Right, Align::Right}};
    bool _isEmpty = true;
};

std::string worstText(const std::optional<RoleStatistics>& role) {
    return role && role->worst
               ? minuteText(role->worst->begin) + " " + figureText(role->worst->figure, role->unit)
               : "-";
}

std::string roleLines(const std::vector<RolePair>& pairs) {
    PairTable table("role");
    TextTable worst({Align::Left, Align::Left, Align::Left});
    worst.add({"worst minute", "A", "B"});
    bool hasWorst = false;
    for (const RolePair& pair : pairs) {
        table.add(std::string(nameOf(pair.role)), pair.unit, isNamingNumber(pair.role),
                  pair.a ? &pair.a->numbers : nullptr, pair.b ? &pair.b->numbers : nullptr);
        if ((pair.a && pair.a->worst) || (pair.b && pair.b->worst)) {
            worst.add({std::string(nameOf(pair.role)), worstText(pair.a), worstText(pair.b)});
            hasWorst = true;
        }
    }
    return table.text() + (hasWorst ? "\n" + worst.text(2) : "");
}

std::string sideShare(const std::optional<double>& share) {
    return share ? figureText(100 * *share) + " %" : "-";
}

/// The shares of time of a state; in a list, of the samples.
std::string stateLines(const LeafPair& pair) {
    const StateDifferences states(pair);
    std::string text = "  " + printable(pair.any().leaf.path);
    if (!pair.any().isInList())
        text += ": " + countText(states.transitionsOfA) + " and " + countText(states.transitionsOfB) +
                " transitions";
    TextTable table({Align::Right, Align::Right, Align::Right, Align::Left});
    table.add({"A", "B", "B - A", ""});
    for (const StateDifferences::Value& each : states.values) {
        const auto difference = each.difference();
        table.add({sideShare(each.a), sideShare(each.b),
                   difference ? (*difference > 0 ? "+" : "") + figureText(100 * *difference) : "-",
                   each.isOthers ? "(others)" : each.text});
    }
    return text + "\n" + table.text(4);
}

std::string technologyLines(const TechnologyPair& pair) {
    std::string text = pair.technology + ": " + countText(pair.a ? pair.a->messages : 0) + " and " +
                       countText(pair.b ? pair.b->messages : 0) + " messages\n";
    PairTable table("field");
    std::string states;
    for (const LeafPair& leaves : pair.leaves) {
        if ((leaves.a && leaves.a->hasNumbers()) || (leaves.b && leaves.b->hasNumbers()))
            table.add(leaves.any().name.empty() ? leaves.any().leaf.path : leaves.any().name,
                      leaves.any().leaf.unit, isNamingNumber(leaves.any().leaf),
                      leaves.a ? &leaves.a->numbers : nullptr, leaves.b ? &leaves.b->numbers : nullptr);
        if ((leaves.a && leaves.a->hasStates()) || (leaves.b && leaves.b->hasStates()))
            states += stateLines(leaves);
    }
    const std::string numbers = table.text();
    return text + (numbers.empty() ? "" : "\n" + numbers) + (states.empty() ? "" : "\nstates\n" + states);
}

} // namespace

std::string statisticsDiffText(const DiffSide& a, const DiffSide& b) {
    std::string text = roleLines(pairRoles(a.statistics(), b.statistics()));
    for (const TechnologyPair& pair : pairTechnologies(a.statistics(), b.statistics()))
        text += (text.empty() ? "" : "\n") + technologyLines(pair);
    return text.empty() ? "no messages\n" : text;
}

} // namespace velmora

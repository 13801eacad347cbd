// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Comparison/NamingNumber.h"
#include "Analysis/Statistics/NumberFigures.h"
#include "Tools/Diff/DiffJSON.h"
#include "Tools/Diff/DiffWriter.h"
#include "Tools/Diff/StateDifferences.h"
#include "Tools/Diff/StatisticsPairs.h"
#include "Tools/Stats/StatisticsValues.h"

namespace velmora {

namespace {

struct NamedFigure {
    const char* name;
    std::optional<double> NumberFigures::*figure;
};

constexpr NamedFigure namedFigures[] = {
    {"minimum", &NumberFigures::minimum}, {"p5", &NumberFigures::p5},
    {"p50", &NumberFigures::p50},         {"p95", &NumberFigures::p95},
    {"maximum", &NumberFigures::maximum}, {"mean", &NumberFigures::mean},
};

Value numbersValue(const ValueCounts* numbers) {
    if (!numbers)
        return {};
    const DictionaryRef object = makeDictionary();
    setNumbers(*object, *numbers, Unit::None, false);
    return object;
}

/// Sets "a", "b" and, where both have figures of numbers that name nothing, "difference".
void setPair(Dictionary& object, bool isNaming, const ValueCounts* a, const ValueCounts* b) {
    object.set("a", numbersValue(a));
    object.set("b", numbersValue(b));
    if (!a || !b || isNaming)
        return;
    const NumberFigures first(*a);
    const NumberFigures second(*b);
    const DictionaryRef difference = makeDictionary();
    for (const NamedFigure& each : namedFigures)
        if (first.*each.figure && second.*each.figure)
            difference->set(each.name, numberValue(*(second.*each.figure) - *(first.*each.figure)));
    object.set("difference", difference);
}

Value roleValue(const RolePair& pair) {
    const DictionaryRef object = makeDictionary();
    object->set("role", std::string(nameOf(pair.role)));
    if (pair.unit != Unit::None)
        object->set("unit", std::string(nameOf(pair.unit)));
    setPair(*object, isNamingNumber(pair.role), pair.a ? &pair.a->numbers : nullptr,
            pair.b ? &pair.b->numbers : nullptr);
    if (WorstMinute::measureOf(pair.role)) {
        object->set("worstMinuteA", pair.a ? worstMinuteValue(*pair.a) : Value());
        object->set("worstMinuteB", pair.b ? worstMinuteValue(*pair.b) : Value());
    }
    return object;
}

DictionaryRef leafObject(const LeafPair& pair) {
    const LeafStatistics& any = pair.any();
    const DictionaryRef object = makeDictionary();
    object->set("path", any.leaf.path);
    if (!any.name.empty())
        object->set("name", any.name);
    return object;
}

Value stateKeyValue(const StateDifferences::Value& value) {
    if (value.isOthers)
        return {};
    if (value.key.kind == ObservedKind::Text)
        return Value(value.key.words);
    return value.key.kind == ObservedKind::Flag ? Value(value.key.raw != 0) : Value(value.key.raw);
}

Value statesValue(const LeafPair& pair) {
    const StateDifferences states(pair);
    const DictionaryRef object = leafObject(pair);
    object->set("shareOf", pair.any().isInList() ? "samples" : "time");
    if (!pair.any().isInList()) {
        object->set("transitionsA", countValue(states.transitionsOfA));
        object->set("transitionsB", countValue(states.transitionsOfB));
    }
    const ArrayRef values = makeArray();
    for (const StateDifferences::Value& each : states.values) {
        const DictionaryRef value = makeDictionary();
        value->set("value", stateKeyValue(each));
        if (!each.isOthers)
            value->set("text", each.text);
        value->set("a", numberValue(each.a));
        value->set("b", numberValue(each.b));
        value->set("difference", numberValue(each.difference()));
        values->append(value);
    }
    object->set("values", values);
    return object;
}

Value technologyValue(const TechnologyPair& pair) {
    const DictionaryRef object = makeDictionary();
    object->set("technology", pair.technology);
    object->set("messagesA", countValue(pair.a ? pair.a->messages : 0));
    object->set("messagesB", countValue(pair.b ? pair.b->messages : 0));
    const ArrayRef numbers = makeArray();
    const ArrayRef states = makeArray();
    for (const LeafPair& leaves : pair.leaves) {
        if ((leaves.a && leaves.a->hasNumbers()) || (leaves.b && leaves.b->hasNumbers())) {
            const DictionaryRef leaf = leafObject(leaves);
            if (const Unit unit = leaves.any().leaf.unit; unit != Unit::None)
                leaf->set("unit", std::string(nameOf(unit)));
            setPair(*leaf, isNamingNumber(leaves.any().leaf), leaves.a ? &leaves.a->numbers : nullptr,
                    leaves.b ? &leaves.b->numbers : nullptr);
            numbers->append(leaf);
        }
        if ((leaves.a && leaves.a->hasStates()) || (leaves.b && leaves.b->hasStates()))
            states->append(statesValue(leaves));
    }
    object->set("numbers", numbers);
    object->set("states", states);
    return object;
}

} // namespace

std::string statisticsDiffJson(const DiffSide& a, const DiffSide& b) {
    const ArrayRef roles = makeArray();
    for (const RolePair& pair : pairRoles(a.statistics(), b.statistics()))
        roles->append(roleValue(pair));
    const ArrayRef technologies = makeArray();
    for (const TechnologyPair& pair : pairTechnologies(a.statistics(), b.statistics()))
        technologies->append(technologyValue(pair));
    const DictionaryRef object = makeDictionary();
    object->set("compared", "statistics");
    object->set("a", a.input().text());
    object->set("b", b.input().text());
    object->set("roles", roles);
    object->set("technologies", technologies);
    return jsonText(object);
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Stats/StatsJSON.h"

#include "Analysis/Statistics/ServingCells.h"
#include "Tools/Output.h"
#include "Tools/Stats/StatisticsValues.h"
#include "Tools/Text/JSONText.h"

#include <string>

namespace velmora {

namespace {

/// What identifies the group.
void setGroup(Dictionary& object, const GroupStatistics& group, const StatsOptions& options) {
    const GroupKey& key = group.key;
    using By = StatisticsPlan::By;
    switch (options.by) {
    case By::Nothing: return;
    case By::File: object.set("file", options.files[key.input.value_or(0)]); return;
    case By::Technology: object.set("technology", key.technology); return;
    case By::Cell:
        object.set("technology", key.technology);
        object.set("cell", group.cell.empty() ? Value() : Value(group.cell));
        if (key.cell == ServingCells::further)
            object.set("furtherCells", true);
        return;
    case By::Square:
        object.set("technology", key.technology);
        object.set("square", group.cell.empty() ? Value() : Value(group.cell));
        if (key.cell == ServingCells::further)
            object.set("furtherSquares", true);
        return;
    case By::Minute:
        object.set("technology", key.technology);
        object.set("minute", key.minute ? timeValue(*key.minute) : Value());
        return;
    }
}

void setUnit(Dictionary& object, Unit unit) {
    if (unit != Unit::None)
        object.set("unit", std::string(nameOf(unit)));
}

DictionaryRef leafObject(const LeafStatistics& leaf) {
    const DictionaryRef object = makeDictionary();
    object->set("path", leaf.leaf.path);
    if (!leaf.name.empty())
        object->set("name", leaf.name);
    if (leaf.leaf.role != Role::None)
        object->set("role", std::string(nameOf(leaf.leaf.role)));
    if (leaf.isInList())
        object->set("list", true);
    object->set("absent", countValue(leaf.absent));
    return object;
}

Value partValue(const TechnologyPart& part, bool hasHistogram) {
    const ArrayRef numbers = makeArray();
    const ArrayRef states = makeArray();
    for (const auto& leaf : part.leaves) {
        if (leaf && leaf->hasNumbers()) {
            const DictionaryRef object = leafObject(*leaf);
            setUnit(*object, leaf->leaf.unit);
            setNumbers(*object, leaf->numbers, leaf->leaf.unit, hasHistogram);
            numbers->append(object);
        }
        if (leaf && leaf->hasStates()) {
            const DictionaryRef object = leafObject(*leaf);
            setStates(*object, leaf->states, leaf->isInList());
            states->append(object);
        }
    }
    const DictionaryRef object = makeDictionary();
    object->set("technology", part.technology);
    object->set("messages", countValue(part.messages));
    if (part.first) {
        object->set("first", timeValue(*part.first));
        object->set("last", timeValue(*part.last));
    }
    if (part.omitted != 0)
        object->set("omitted", countValue(part.omitted));
    object->set("numbers", numbers);
    object->set("states", states);
    return object;
}

Value roleValue(const RoleStatistics& role, const StatsOptions& options) {
    const DictionaryRef object = makeDictionary();
    object->set("role", std::string(nameOf(role.role)));
    setUnit(*object, role.unit);
    object->set("absent", countValue(role.absent));
    setNumbers(*object, role.numbers, role.unit, options.hasHistogram);
    if (role.measure && options.by != StatisticsPlan::By::Minute)
        object->set("worstMinute", worstMinuteValue(role));
    return object;
}

} // namespace

void StatsJSON::write(const GroupStatistics& group) {
    const DictionaryRef object = makeDictionary();
    setGroup(*object, group, _options);
    const ArrayRef roles = makeArray();
    for (const RoleStatistics& role : rolesOf(group))
        roles->append(roleValue(role, _options));
    object->set("roles", roles);
    const ArrayRef technologies = makeArray();
    for (const auto& part : group.parts)
        technologies->append(partValue(*part, _options.hasHistogram));
    object->set("technologies", technologies);
    TextBuffer text;
    appendIndentedJson(text, object);
    text.append('\n');
    _output.put(text.view());
    _output.flush();
}

} // namespace velmora

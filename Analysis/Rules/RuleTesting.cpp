// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/RuleTesting.h"

#include "Analysis/Rules/Evaluation/PathInputs.h"
#include "Analysis/Rules/Evaluation/RuleRunner.h"
#include "Analysis/Rules/Expression/PathLeaves.h"
#include "Analysis/Rules/Expression/RuleUnit.h"

#include <algorithm>
#include <chrono>
#include <memory>
#include <vector>

namespace velmora {

namespace {

class CollectedEvents final : public EventSink {
public:
    void happened(const Event& event) override { events.push_back(event); }

    std::vector<Event> events;
};

std::string inSeconds(Time::duration span) {
    return numberWithUnit(std::chrono::duration<double>(span).count(), Unit::Second);
}

std::string describe(Time::duration begin, std::optional<Time::duration> end, const std::string& text,
                     bool lasts) {
    std::string description = inSeconds(begin);
    if (lasts)
        description += " to " + (end ? inSeconds(*end) : std::string("an unknown end"));
    return text.empty() ? description : description + " \"" + text + "\"";
}

/// Whether the event is as expected; times are equal to the millisecond.
bool isSame(const Event& event, const RuleTestEvent& expected) {
    const auto isNear = [](Time::duration a, Time::duration b) {
        return a - b < std::chrono::milliseconds(1) && b - a < std::chrono::milliseconds(1);
    };
    if (!isNear(event.time.time_since_epoch(), expected.time) ||
        event.end.has_value() != expected.end.has_value())
        return false;
    return (!event.end || isNear(event.end->time_since_epoch(), *expected.end)) &&
           (!expected.text || *expected.text == event.text);
}

void setValue(const RuleTestStep::Value& value, const Catalogue& catalogue, PathInputs& paths,
              InputStore& inputs) {
    const ReportedValue reported{value.kind, value.number, value.text};
    if (!value.input.isPath()) {
        for (std::uint32_t i = 0; i < inputs.slots().size(); ++i)
            if (inputs.slot(i).input == value.input)
                inputs.set(i, reported);
        return;
    }
    for (const PathLeaf& each : leavesAt(catalogue, value.input.path)) {
        std::vector<std::uint32_t> rows;
        for (const std::optional<std::uint32_t>& row : each.rows)
            rows.push_back(row.value_or(0));
        if (value.kind != ObservedKind::Absent)
            paths.set(*each.leaf, rows, reported, inputs);
        else
            paths.remove(*each.leaf, inputs);
    }
}

std::string listed(const std::vector<std::string>& descriptions) {
    if (descriptions.empty())
        return "no event";
    std::string list;
    for (const std::string& each : descriptions)
        list += (list.empty() ? "" : ", ") + each;
    return list;
}

} // namespace

std::string runRuleTest(const Rule& rule, const RuleTest& test, const Catalogue& catalogue) {
    const std::shared_ptr<const Rule> alone(&rule, [](const Rule*) {});
    RuleRunner runner({&alone, 1}, catalogue.technology());
    PathInputs paths(catalogue, runner.inputs());
    CollectedEvents sink;
    std::uint64_t number = 0;
    for (const RuleTestStep& step : test.steps) {
        if (step.isInterruption)
            runner.interrupt(sink);
        runner.beginTurn({0, ++number}, Time(step.at));
        for (const RuleTestStep::Value& value : step.values)
            setValue(value, catalogue, paths, runner.inputs());
        if (step.neighbours) {
            std::vector<Neighbour> neighbours = *step.neighbours;
            // As the picture has them: the strongest first.
            std::stable_sort(
                neighbours.begin(), neighbours.end(),
                [](const Neighbour& a, const Neighbour& b) { return a.level_dBm > b.level_dBm; });
            for (Neighbour& each : neighbours)
                each.time = Time(step.at);
            runner.inputs().setNeighbours(neighbours);
        }
        runner.evaluate(sink);
    }
    runner.interrupt(sink);

    std::vector<std::string> got;
    for (const Event& each : sink.events)
        got.push_back(describe(each.time.time_since_epoch(),
                               each.end ? std::optional(each.end->time_since_epoch()) : std::nullopt,
                               each.text, each.lasts));
    if (std::equal(sink.events.begin(), sink.events.end(), test.events.begin(), test.events.end(), isSame))
        return {};
    std::vector<std::string> wanted;
    for (const RuleTestEvent& each : test.events)
        wanted.push_back(describe(each.time, each.end, each.text.value_or(""), rule.lasts));
    return "got " + listed(got) + ", wanted " + listed(wanted);
}

} // namespace velmora

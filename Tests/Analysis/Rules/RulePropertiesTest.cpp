// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Evaluation/RuleRunner.h"
#include "Analysis/Rules/Rule.h"
#include "Tests/Analysis/Rules/RuleFixture.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <algorithm>
#include <map>
#include <optional>
#include <random>

namespace velmora {
namespace {

/// A message: how long after the one before, and what it reports.
struct Step {
    int milliseconds = 0;
    std::optional<int> level; ///< dBm; absent: not reported
    bool isLost = false;      ///< the level is not known any more
    std::optional<int> cell;
};

void showValue(const Step& step, std::ostream& out) {
    out << "+" << step.milliseconds << " ms";
    if (step.level)
        out << " level " << *step.level;
    if (step.isLost)
        out << " lost";
    if (step.cell)
        out << " cell " << *step.cell;
}

std::vector<Step> givenSteps() {
    const auto step = rc::gen::exec([] {
        Step made;
        made.milliseconds = *rc::gen::element(0, 1, 500, 999, 1000, 1001, 2500, 5000, 11000);
        if (*rc::gen::arbitrary<bool>())
            made.level = *rc::gen::inRange(-115, -104);
        made.isLost = !made.level && *rc::gen::inRange(0, 10) == 0;
        if (*rc::gen::arbitrary<bool>())
            made.cell = *rc::gen::inRange(1, 4);
        return made;
    });
    return *rc::gen::container<std::vector<Step>>(step);
}

std::string rule(const std::string& name, const std::string& keys) {
    return "[[rule]]\nname = \"" + name + "\"\ntext = \"{serving.level} {serving.cell}\"\n" + keys + "\n";
}

/// One of each kind of rule that time can change.
std::vector<std::string> givenRules() {
    return {
        rule("plain", "when = \"serving.level < -110\""),
        rule("held", "when = \"serving.level < -110\"\nfor = 2"),
        rule("kept", "when = \"serving.level < -110\"\nfor = 1\nkeep = 3"),
        rule("cleared", "when = \"serving.level < -110\"\nclear = \"serving.level > -106\"\nkeep = 1"),
        rule("old", "when = \"age(serving.level) >= 1 s\""),
        rule("young", "when = \"2 s > age(serving.level)\"\nfor = 1"),
        rule("sum", "when = \"age(serving.level) + age(serving.cell) > 3 s\""),
        rule("fall", "when = \"delta(serving.level, 2 s) < -3 dB\""),
        rule("restless", "when = \"count(changed(serving.cell), 5 s) >= 2\""),
        rule("weak-often", "when = \"count(serving.level < -110, 3 s) > 1\"\nkeep = 1"),
        rule("moved", "when = \"changed(serving.cell)\"\nlasts = false"),
        rule("moved-weak", "when = \"changed(serving.cell) or not known(serving.level)\"\nkeep = 1"),
    };
}

class FilledInputs {
public:
    static void fill(InputStore& inputs, const Step& step) {
        for (std::uint32_t i = 0; i < inputs.slots().size(); ++i) {
            const Role role = inputs.slot(i).input.role;
            if (role == Role::ServingLevel && step.level)
                inputs.set(i, {ObservedKind::Number, static_cast<double>(*step.level)});
            if (role == Role::ServingLevel && step.isLost)
                inputs.remove(i);
            if (role == Role::ServingCell && step.cell)
                inputs.set(i, {ObservedKind::Number, static_cast<double>(*step.cell)});
        }
    }
};

std::string fileOf(const std::vector<std::string>& rules) {
    std::string file;
    for (const std::string& each : rules)
        file += each;
    return file;
}

/// What the rules make of the messages: for each event its line, with text and evidence.
std::vector<std::string> eventsOf(const RuleSet& rules, const std::vector<Step>& steps, double start_s = 0) {
    RuleRunner runner(rules.rules(), "Ostrel_LTE");
    EventTexts sink;
    std::uint64_t number = 0;
    Time now = at(start_s);
    for (const Step& step : steps) {
        now += std::chrono::milliseconds(step.milliseconds);
        runner.beginTurn({0, ++number}, now);
        FilledInputs::fill(runner.inputs(), step);
        runner.evaluate(sink);
    }
    runner.interrupt(sink);
    std::vector<std::string> lines;
    for (const Event& event : sink.events) {
        std::string line = event.kind + " " + std::to_string((event.time - at(start_s)).count()) + " " +
                           (event.end ? std::to_string((*event.end - at(start_s)).count()) : "?") + " " +
                           event.text;
        for (const MessageNumber& each : event.evidence)
            line += " " + std::to_string(each.number);
        lines.push_back(line);
    }
    return lines;
}

RC_GTEST_PROP(RulePropertiesTest, EvaluatingOnlyWhatMayHaveChangedMakesTheSameEvents, ()) {
    const RuleSet rules = ruleSet(fileOf(givenRules()));
    const std::vector<Step> steps = givenSteps();
    for (const std::shared_ptr<const Rule>& rule : rules.rules()) {
        // Every rule at every message, without any schedule.
        InputStore inputs;
        RuleState state(rule, inputs, "Ostrel_LTE");
        EventTexts expected;
        RuleRunner runner({&rule, 1}, "Ostrel_LTE");
        EventTexts sink;
        std::uint64_t number = 0;
        Time now = at(0);
        for (const Step& step : steps) {
            now += std::chrono::milliseconds(step.milliseconds);
            inputs.beginTurn({0, ++number}, now);
            FilledInputs::fill(inputs, step);
            (void)state.evaluate(inputs, expected);
            runner.beginTurn({0, number}, now);
            FilledInputs::fill(runner.inputs(), step);
            runner.evaluate(sink);
            RC_ASSERT(sink.begun == expected.begun);
            RC_ASSERT(sink.texts == expected.texts);
        }
    }
}

RC_GTEST_PROP(RulePropertiesTest, TheOrderOfRulesDoesNotMatter, ()) {
    std::vector<std::string> rules = givenRules();
    const std::vector<Step> steps = givenSteps();
    const std::vector<std::string> expected = eventsOf(ruleSet(fileOf(rules)), steps);
    const auto seed = *rc::gen::arbitrary<std::uint32_t>();
    std::shuffle(rules.begin(), rules.end(), std::minstd_rand(seed));
    RC_ASSERT(eventsOf(ruleSet(fileOf(rules)), steps) == expected);
}

RC_GTEST_PROP(RulePropertiesTest, ARuleMakesTheSameEventsAloneAndBesideOthers, ()) {
    const std::vector<Step> steps = givenSteps();
    const std::vector<std::string> together = eventsOf(ruleSet(fileOf(givenRules())), steps);
    for (const std::string& each : givenRules()) {
        const RuleSet alone = ruleSet(each);
        const std::string name = alone.rules()[0]->name + " ";
        std::vector<std::string> own;
        std::copy_if(together.begin(), together.end(), std::back_inserter(own),
                     [&name](const std::string& line) { return line.starts_with(name); });
        RC_ASSERT(eventsOf(alone, steps) == own);
    }
}

RC_GTEST_PROP(RulePropertiesTest, ShiftingAllTimesShiftsTheEventsAndNothingElse, ()) {
    const RuleSet rules = ruleSet(fileOf(givenRules()));
    const std::vector<Step> steps = givenSteps();
    const int shift = *rc::gen::inRange(-1000000, 1000000);
    RC_ASSERT(eventsOf(rules, steps, shift) == eventsOf(rules, steps));
}

/// Checks each event when it begins against the messages so far.
class NeverEarly final : public EventSink {
public:
    void began(const Event& event) override {
        RC_ASSERT(now - event.time >= std::chrono::seconds(2));
        for (const auto& [time, level] : levels)
            RC_ASSERT(time < event.time || level < -110);
        RC_ASSERT(levels.contains(event.time));
        RC_ASSERT(levels.upper_bound(event.time) != levels.end()); // a second measurement
    }
    void happened(const Event&) override {}

    Time now{};
    std::map<Time, int> levels; ///< the latest of each time
};

RC_GTEST_PROP(RulePropertiesTest, ARuleWithForNeverFiresEarly, ()) {
    const RuleSet rules = ruleSet(rule("held", "when = \"serving.level < -110\"\nfor = \"2s\""));
    RuleRunner runner(rules.rules(), "Ostrel_LTE");
    NeverEarly sink;
    sink.now = at(0);
    std::uint64_t number = 0;
    for (Step step : givenSteps()) {
        step.milliseconds = std::max(step.milliseconds, 1); // a level a time
        sink.now += std::chrono::milliseconds(step.milliseconds);
        runner.beginTurn({0, ++number}, sink.now);
        FilledInputs::fill(runner.inputs(), step);
        if (step.level)
            sink.levels[sink.now] = *step.level;
        runner.evaluate(sink);
    }
}

} // namespace
} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Extra/ExtraPayload.h"
#include "LogGenerator/GSM/AssertionFailure.h"
#include "LogGenerator/Observations/Observation.h"
#include "Tests/LogGenerator/Observations/DecodedTechnology.h"
#include "Tests/LogGenerator/Observations/RandomMessages.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <functional>
#include <string>
#include <vector>

// What a sink wants of a message is observed as without a choice, in the same order, and nothing else is: of
// drives, and of messages that no modem sends.

namespace velmora {
namespace {

using Choice = std::function<bool(const CatalogueField&)>;
using Lines = std::vector<std::string>;

bool isKeyOfItsRow(const CatalogueField& leaf) {
    return std::find(leaf.keys.begin(), leaf.keys.end(), leaf.node->name()) != leaf.keys.end();
}

/// Writes down what is observed of the leaves of a choice, whatever else is.
class Notes : public ObservationSink {
public:
    explicit Notes(Choice choice, bool notesKeys = true)
        : _choice(std::move(choice)), _notesKeys(notesKeys) {}

    void observed(const ObservedMessage& message) override {
        lines.clear();
        others.clear();
        for (const Observation& each : message.observations)
            (_choice(*each.leaf) ? lines : others).push_back(lineOf(each));
        for (const CatalogueField* const leaf : message.removed)
            (_choice(*leaf) ? lines : others).push_back("- " + leaf->path);
    }

    Lines lines;
    Lines others;

private:
    std::string lineOf(const Observation& each) {
        std::string line;
        each.appendPath(line);
        line += " " + std::to_string(static_cast<int>(each.kind)) + " " + std::to_string(each.number) + " " +
                std::to_string(each.raw) + " " + std::string(each.words) + " " + std::string(_text.of(each));
        if (_notesKeys)
            line += " [" + std::string(each.rowKey) + "]";
        return line;
    }

protected:
    Choice _choice;
    bool _notesKeys;

private:
    ObservedText _text;
};

/// Wants no other leaves.
class Chooser final : public Notes {
public:
    using Notes::Notes;
    [[nodiscard]] bool wants(const CatalogueField& leaf) const override { return _choice(leaf); }
    [[nodiscard]] bool wantsRowKeys() const override { return _notesKeys; }
};

class WantedLeavesTest : public testing::TestWithParam<DecodedTechnology> {
protected:
    static std::vector<Data> messages() {
        const std::unique_ptr<Scenario> scenario = scenarioKindNamed(GetParam().scenario)->make(5);
        std::vector<Data> all(2000);
        for (Data& each : all)
            each = scenario->next().message;
        TechnologyUnderTest tested{GetParam()};
        RandomMessages random(tested.decoder(), all, 7);
        for (int i = 0; i < 2000; ++i)
            all.push_back(random.next());
        return all;
    }

    static void update(TechnologyUnderTest& tested, const Data& message) {
        try {
            tested.decoder().updateState(tested.state, message);
        } catch (const LogCode_0xFF0000::UnknownDataException&) {
        } catch (const AssertionFailure&) {
        }
    }

    /// Expects of each message what was chosen and, where no row keys are made of it, nothing else. Returns
    /// how much was chosen.
    static std::size_t expectChosen(const Choice& choice, bool hasKeys) {
        Notes all(choice, hasKeys);
        Chooser some(choice, hasKeys);
        TechnologyUnderTest first{GetParam()};
        TechnologyUnderTest second{GetParam()};
        first.decoder().setObservationSink(&all);
        second.decoder().setObservationSink(&some);
        std::size_t chosen = 0;
        for (const Data& message : messages()) {
            update(first, message);
            update(second, message);
            EXPECT_EQ(some.lines, all.lines);
            if (!hasKeys) {
                EXPECT_THAT(some.others, testing::IsEmpty());
            }
            if (testing::Test::HasFailure())
                break;
            chosen += some.lines.size();
        }
        first.decoder().setObservationSink(nullptr);
        second.decoder().setObservationSink(nullptr);
        return chosen;
    }
};

TEST_P(WantedLeavesTest, EveryThirdLeaf) {
    for (std::size_t rest = 0; rest < 3; ++rest)
        EXPECT_GT(expectChosen([rest](const CatalogueField& leaf) { return leaf.index % 3 == rest; }, false),
                  0u);
}

TEST_P(WantedLeavesTest, RowKeysAreMadeOfLeavesThatNothingElseWants) {
    expectChosen([](const CatalogueField& leaf) { return !isKeyOfItsRow(leaf) && leaf.index % 2 == 0; },
                 true);
}

TEST_P(WantedLeavesTest, None) {
    EXPECT_EQ(expectChosen([](const CatalogueField&) { return false; }, false), 0u);
}

INSTANTIATE_TEST_SUITE_P(Technologies, WantedLeavesTest, testing::ValuesIn(decodedTechnologies),
                         [](const auto& tested) { return std::string(tested.param.scenario); });

} // namespace
} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Evaluation/RuleRunner.h"
#include "Tests/Analysis/Rules/RuleFixture.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <optional>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

/// A rule that reads the level alone, over levels at times.
class RuleTimingTest : public testing::Test {
protected:
    void use(const std::string& keys) {
        _rules.emplace(ruleSet("[[rule]]\nname = \"weak\"\ntext = \"{serving.level}\"\n" + keys));
        _runner.emplace(_rules->rules(), "Ostrel_LTE");
    }
    void level(double seconds, std::optional<double> dBm) {
        message(seconds, [&](InputStore& inputs) {
            if (dBm)
                inputs.set(0, {ObservedKind::Number, *dBm});
            else
                inputs.remove(0);
        });
    }
    /// One that does not report the level.
    void other(double seconds) {
        message(seconds, [](InputStore&) {});
    }
    void end() { _runner->interrupt(sink); }

    EventTexts sink;

private:
    template <class Fill>
    void message(double seconds, Fill fill) {
        _runner->beginTurn({0, ++_number}, at(seconds));
        fill(_runner->inputs());
        _runner->evaluate(sink);
    }

    std::optional<RuleSet> _rules;
    std::optional<RuleRunner> _runner;
    std::uint64_t _number = 0;
};

TEST_F(RuleTimingTest, AnEventLastsWhileTheConditionHolds) {
    use("when = \"serving.level < -110\"");
    level(0, -100);
    level(1, -111);
    EXPECT_THAT(sink.begun, ElementsAre("weak 1"));
    level(2, -112);
    EXPECT_THAT(sink.texts, IsEmpty());
    level(3, -110);
    EXPECT_THAT(sink.texts, ElementsAre("weak 1 to 3"));
    EXPECT_EQ(sink.events[0].text, "-111 dBm");
    EXPECT_EQ(std::get<double>(sink.events[0].field("value")->value), -111);
    EXPECT_EQ(sink.events[0].field("value")->unit, Unit::DBm);
    EXPECT_EQ(std::get<double>(sink.events[0].field("duration")->value), 2);
    EXPECT_THAT(sink.events[0].evidence, ElementsAre(MessageNumber{0, 2}, MessageNumber{0, 3}));
}

TEST_F(RuleTimingTest, ForDelaysTheReportAndNotTheBegin) {
    use("when = \"serving.level < -110\"\nfor = \"5s\"");
    level(1, -111);
    level(4.5, -112);
    other(5.9);
    EXPECT_THAT(sink.begun, IsEmpty());
    other(6);
    EXPECT_THAT(sink.begun, ElementsAre("weak 1"));
    level(7, -100);
    EXPECT_THAT(sink.texts, ElementsAre("weak 1 to 7"));
}

TEST_F(RuleTimingTest, ForStartsAgainWhenTheConditionFails) {
    use("when = \"serving.level < -110\"\nfor = 5");
    level(0, -111);
    level(4, -100);
    level(4.5, -111);
    level(9, -111);
    EXPECT_THAT(sink.begun, IsEmpty());
    level(9.5, -111);
    EXPECT_THAT(sink.begun, ElementsAre("weak 4.5"));
}

TEST_F(RuleTimingTest, ForNeedsASecondMeasurement) {
    use("when = \"serving.level < -110\"\nfor = \"5s\"");
    level(1, -111);
    level(1, -112); // at the same time
    other(6);
    other(7);
    EXPECT_THAT(sink.begun, IsEmpty());
    level(8, -111);
    EXPECT_THAT(sink.begun, ElementsAre("weak 1"));
}

TEST_F(RuleTimingTest, ForNeedsAMeasurementInItsLastTwoSeconds) {
    use("when = \"serving.level < -110\"\nfor = \"5s\"");
    level(1, -111);
    level(2, -112);
    level(3.9, -112);
    other(6);
    other(7);
    EXPECT_THAT(sink.begun, IsEmpty());
    level(8, -111);
    EXPECT_THAT(sink.begun, ElementsAre("weak 1"));
}

TEST_F(RuleTimingTest, AMeasurementTwoSecondsBeforeForIsOverIsEnough) {
    use("when = \"serving.level < -110\"\nfor = \"5s\"");
    level(1, -111);
    level(4, -112);
    other(6);
    EXPECT_THAT(sink.begun, ElementsAre("weak 1"));
}

TEST_F(RuleTimingTest, TheMeasurementBeforeAFailureDoesNotCountForTheNextTime) {
    use("when = \"serving.level < -110\"\nfor = \"5s\"");
    level(0, -111);
    level(1, -111);
    level(2, -100);
    level(3, -111);
    other(8);
    EXPECT_THAT(sink.begun, IsEmpty());
}

TEST_F(RuleTimingTest, AValueThatIsGoneIsNoMeasurement) {
    use("when = \"serving.level < -110\"\nfor = \"5s\"");
    level(0, -111);
    level(1, std::nullopt);
    other(5);
    level(9, -100);
    end();
    EXPECT_THAT(sink.begun, IsEmpty());
}

TEST_F(RuleTimingTest, WhatIsNoMeasurementHoldsUntilAnotherReport) {
    use("when = \"serving.channel == 6300\"\nfor = \"5s\"");
    level(0, 6300);
    other(5);
    EXPECT_THAT(sink.begun, ElementsAre("weak 0"));
}

TEST_F(RuleTimingTest, AnAgeNeedsNoReport) {
    use("when = \"age(serving.level) >= 1 s\"\nfor = \"3s\"");
    level(0, -111);
    other(1);
    other(4); // the level is known for 5 s
    EXPECT_THAT(sink.begun, ElementsAre("weak 1"));
}

TEST_F(RuleTimingTest, AMessageThatEndsTheConditionDoesNotConfirmIt) {
    // Between the messages nothing is known, so that no event is claimed.
    use("when = \"serving.level < -110\"\nfor = \"5s\"");
    level(0, -111);
    level(20, -100);
    end();
    EXPECT_THAT(sink.begun, IsEmpty());
    EXPECT_THAT(sink.texts, IsEmpty());
}

TEST_F(RuleTimingTest, ClearIsAHysteresis) {
    use("when = \"serving.level < -110\"\nclear = \"serving.level > -105\"");
    level(0, -111);
    level(1, -107);
    level(2, -105);
    EXPECT_THAT(sink.texts, IsEmpty());
    level(3, -104);
    EXPECT_THAT(sink.texts, ElementsAre("weak 0 to 3"));
}

TEST_F(RuleTimingTest, NoEventBeginsWhileClearHolds) {
    use("when = \"serving.level < -110\"\nclear = \"serving.level < -120\"");
    level(0, -121);
    EXPECT_THAT(sink.begun, IsEmpty());
    level(1, -115);
    EXPECT_THAT(sink.begun, ElementsAre("weak 1"));
}

TEST_F(RuleTimingTest, KeepJoinsEventsWithAShortPauseBetween) {
    use("when = \"serving.level < -110\"\nkeep = \"3 s\"");
    level(0, -111);
    level(1, -100);
    level(3.9, -111);
    level(5, -100);
    other(7.9);
    EXPECT_THAT(sink.texts, IsEmpty());
    other(8);
    EXPECT_THAT(sink.texts, ElementsAre("weak 0 to 5"));
    EXPECT_THAT(sink.begun, ElementsAre("weak 0"));
}

TEST_F(RuleTimingTest, AShortUnknownTimeIsBridged) {
    use("when = \"serving.level < -110\"\nfor = 5");
    level(0, -111);
    level(1, std::nullopt);
    other(5);
    EXPECT_THAT(sink.begun, IsEmpty()); // not confirmed while it is unknown
    level(6, -111);
    EXPECT_THAT(sink.begun, ElementsAre("weak 0"));
    level(7, std::nullopt);
    level(16, -112);
    level(17, -100);
    EXPECT_THAT(sink.texts, ElementsAre("weak 0 to 17"));
}

TEST_F(RuleTimingTest, ALongUnknownTimeEndsTheEventWithoutAnEndOfItsOwn) {
    use("when = \"serving.level < -110\"");
    level(0, -111);
    level(1, std::nullopt);
    other(10.9);
    EXPECT_THAT(sink.texts, IsEmpty());
    other(11);
    EXPECT_THAT(sink.texts, ElementsAre("weak 0 to ?"));
    EXPECT_FALSE(sink.events[0].field("duration"));
}

TEST_F(RuleTimingTest, ALongUnknownTimeStartsForFromTheBeginning) {
    use("when = \"serving.level < -110\"\nfor = 5");
    level(0, -111);
    level(1, std::nullopt);
    level(12, -111);
    EXPECT_THAT(sink.begun, IsEmpty());
    level(17, -111);
    EXPECT_THAT(sink.begun, ElementsAre("weak 12"));
}

TEST_F(RuleTimingTest, AnInterruptionEndsWhatLasts) {
    use("when = \"serving.level < -110\"");
    level(0, -111);
    end();
    EXPECT_THAT(sink.texts, ElementsAre("weak 0 to ?"));
    other(1);
    end();
    EXPECT_THAT(sink.begun, ElementsAre("weak 0")); // the level is not known any more
}

TEST_F(RuleTimingTest, AnEndThatIsNotConfirmedStaysTheEndAtAnInterruption) {
    use("when = \"serving.level < -110\"\nkeep = 5");
    level(0, -111);
    level(2, -100);
    other(3);
    end();
    EXPECT_THAT(sink.texts, ElementsAre("weak 0 to 2"));
}

TEST_F(RuleTimingTest, ARuleWithoutDurationMakesOneEventAtItsBegin) {
    use("when = \"serving.level < -110\"\nlasts = false");
    level(0, -111);
    EXPECT_THAT(sink.texts, ElementsAre("weak 0"));
    level(1, -112);
    level(2, -100);
    level(3, -112);
    end();
    EXPECT_THAT(sink.texts, ElementsAre("weak 0", "weak 3"));
    EXPECT_THAT(sink.begun, IsEmpty());
}

TEST_F(RuleTimingTest, ATimeThatGoesBackALittleCountsAsTheLatest) {
    use("when = \"serving.level < -110\"\nfor = 5");
    level(5, -111);
    level(4.5, -111);
    level(5.5, -111);
    level(8.5, -111);
    other(9.9);
    EXPECT_THAT(sink.begun, IsEmpty());
    other(10);
    EXPECT_THAT(sink.begun, ElementsAre("weak 5"));
}

TEST_F(RuleTimingTest, AnAgeIsNoticedByAnyMessage) {
    use("when = \"age(serving.level) >= 3 s\"");
    level(0, -90);
    other(2.9);
    EXPECT_THAT(sink.begun, IsEmpty());
    other(3);
    EXPECT_THAT(sink.begun, ElementsAre("weak 3"));
    level(4, -90);
    EXPECT_THAT(sink.texts, ElementsAre("weak 3 to 4"));
}

TEST_F(RuleTimingTest, AWindowIsNoticedByAnyMessageWhenItPasses) {
    use("when = \"count(serving.level < -110, 10 s) >= 2\"");
    level(0, -111);
    level(4, -111);
    EXPECT_THAT(sink.begun, ElementsAre("weak 4"));
    other(9.9);
    EXPECT_THAT(sink.texts, IsEmpty());
    other(10);
    EXPECT_THAT(sink.texts, ElementsAre("weak 4 to 10"));
}

TEST_F(RuleTimingTest, EvidenceIsTheFirstMessagesAndTheLatest) {
    use("when = \"serving.level < -110\"");
    for (int i = 0; i < 20; ++i)
        level(i, -111 - i);
    level(20, -100);
    std::vector<std::uint64_t> numbers;
    for (const MessageNumber& each : sink.events.at(0).evidence)
        numbers.push_back(each.number);
    EXPECT_THAT(numbers, ElementsAre(1, 2, 3, 4, 17, 18, 19, 20));
}

} // namespace
} // namespace velmora

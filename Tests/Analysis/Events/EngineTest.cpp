// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Analysis/Events/HandMade.h"

#include <gmock/gmock.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

TEST(EventEngine, ReportsASilenceOfMoreThanThirtySeconds) {
    LTEEngine lte;
    lte.serve(0, 17);
    lte.serve(30, 17);
    EXPECT_THAT(lte.lines(), IsEmpty());
    lte.serve(60.5, 18); // no change of the cell is claimed
    EXPECT_THAT(lte.lines(), ElementsAre("30.000 gap: no message for 30.500 s"));
    const Event& gap = lte.only("gap");
    EXPECT_EQ(gap.end, lte.at(60.5).time());
    EXPECT_EQ(numberOf(gap, "duration"), 30.5);
    EXPECT_THAT(gap.evidence, ElementsAre(MessageNumber{0, 2}, MessageNumber{0, 3}));
}

TEST(EventEngine, ReportsAClockThatGoesBackByMoreThanASecond) {
    LTEEngine lte;
    lte.serve(10, 17);
    lte.serve(9, 18); // messages out of order
    EXPECT_THAT(lte.lines(),
                ElementsAre("9.000 cell-change: PCI 17 on EARFCN 1300 to PCI 18 on EARFCN 1300"));
    lte.serve(8.5, 19); // 1.5 s before the latest time
    EXPECT_THAT(lte.linesOf("clock-jump"), ElementsAre("8.500 the clock went back by 1.500 s"));
    EXPECT_EQ(numberOf(lte.only("clock-jump"), "value"), -1.5);
    EXPECT_EQ(lte.linesOf("cell-change").size(), 1U);
    lte.serve(9, 20);
    EXPECT_EQ(lte.linesOf("cell-change").size(), 2U);
}

TEST(EventEngine, DistinguishesAClockThatLeapsAheadFromSilence) {
    LTEEngine lte;
    lte.send(lte.at(0).arrivedAt(0));
    lte.send(lte.at(100).arrivedAt(1));
    lte.send(lte.at(200).arrivedAt(101));
    EXPECT_THAT(lte.lines(), ElementsAre("100.000 clock-jump: the clock leapt ahead by 100.000 s",
                                         "100.000 gap: no message for 100.000 s"));
}

TEST(EventEngine, ReportsANoteAtTheTimeOfItsMessage) {
    LTEEngine lte;
    lte.serve(0, 17);
    lte.serve(2, 17);
    lte.engine.noted({0, 2}, "the lift");
    EXPECT_THAT(lte.lines(), ElementsAre("2.000 note: the lift"));
    EXPECT_EQ(lte.only("note").severity, Severity::Info);
    EXPECT_THAT(lte.only("note").evidence, ElementsAre(MessageNumber{0, 2}));
}

TEST(EventEngine, ReportsMalformedMessagesAndTakesNothingFromThem) {
    LTEEngine lte;
    lte.serve(0, 17);
    lte.send(lte.at(1).number(servingPCI, 18).number(servingEARFCN, 1300).damaged(Damage::TooShort, 0xB0C2));
    lte.send(lte.at(2).damaged(Damage::NoRecord, std::nullopt));
    lte.serve(3, 17);
    EXPECT_THAT(lte.lines(), ElementsAre("1.000 malformed: too short: 0xB0C2", "2.000 malformed: no record"));
    EXPECT_EQ(textOf(lte.kept.events[0], "code"), "0xB0C2");
    EXPECT_EQ(textOf(lte.kept.events[0], "reason"), "too short");
    EXPECT_EQ(lte.kept.events[1].field("code"), nullptr);
}

TEST(EventEngine, ForgetsWhatItKnewAfterDamageToTheFile) {
    LTEEngine lte;
    lte.serve(5, 17);
    lte.engine.damaged({0, 2}, "a block is cut off");
    lte.serve(6, 18);
    EXPECT_THAT(lte.lines(), ElementsAre("5.000 malformed: a block is cut off"));
    EXPECT_THAT(lte.kept.events[0].evidence, ElementsAre(MessageNumber{0, 2}));
}

TEST(EventEngine, GoesOnAfterTheEndOfAFile) {
    LTEEngine lte;
    lte.measureIdle(0, 17, -90);
    lte.engine.finish();
    lte.serve(2, 18);
    EXPECT_THAT(lte.lines(),
                ElementsAre("2.000 cell-reselection: PCI 17 on EARFCN 1300 to PCI 18 on EARFCN 1300"));
}

class CountingDetector final : public Detector {
public:
    explicit CountingDetector(std::string& calls) : _calls(calls) {}
    void report(const MessageReport&, const RadioPicture& picture, EventSink&) override {
        _calls += picture.technology() ? 'R' : 'r';
    }
    void interrupt(Time, EventSink&) override { _calls += 'i'; }
    void finish(Time, EventSink&) override { _calls += 'f'; }

private:
    std::string& _calls;
};

TEST(EventEngine, PassesEveryMessageButMalformedOnesToADetectorAfterThePicture) {
    std::string calls;
    LTEEngine lte;
    lte.engine.add(std::make_unique<CountingDetector>(calls));
    lte.send(lte.at(0));
    lte.serve(1, 17);
    lte.send(lte.at(2).damaged(Damage::NoRecord, std::nullopt));
    lte.send(lte.at(40));
    lte.engine.finish();
    lte.engine.finish();
    EXPECT_EQ(calls, "rRirf");
}

} // namespace
} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Analysis/Events/DriveEvents.h"

#include <gmock/gmock.h>
#include <rapidcheck/gtest.h>

#include <algorithm>
#include <map>

namespace velmora {
namespace {

using testing::Contains;

/// The events' lines, with their ends and evidence.
std::vector<std::string> accountOf(const KeptEvents& kept, Time from) {
    std::vector<std::string> lines = kept.lines(from);
    for (std::size_t i = 0; i < lines.size(); ++i) {
        const Event& event = kept.events[i];
        if (event.end)
            lines[i] += " until " + std::to_string((*event.end - from).count());
        for (const MessageNumber& each : event.evidence)
            lines[i] += ' ' + std::to_string(each.number);
        for (const EventField& each : event.fields)
            if (const double* const number = std::get_if<double>(&each.value))
                lines[i] += ' ' + each.name + '=' + std::to_string(*number);
    }
    return lines;
}

std::vector<std::string> accountOf(const DecodedTechnology& technology,
                                   const std::vector<ScenarioEvent>& messages, Time start) {
    EngineUnderTest engine(technology);
    for (const ScenarioEvent& each : messages)
        engine.decode(each.message, start + each.offset);
    engine.engine.finish();
    return accountOf(engine.kept, start);
}

DecodedTechnology anyTechnology() {
    return *rc::gen::elementOf(
        std::vector<DecodedTechnology>(std::begin(decodedTechnologies), std::end(decodedTechnologies)));
}

std::vector<ScenarioEvent> anyDrive(const DecodedTechnology& technology) {
    const auto seed = *rc::gen::inRange<std::uint64_t>(1, 1000);
    return messagesOf(technology, seed, *rc::gen::inRange<std::size_t>(1, 1200));
}

RC_GTEST_PROP(DriveEvents, ShiftWithTheirMessagesAndDoNotChangeOtherwise, ()) {
    const DecodedTechnology technology = anyTechnology();
    const std::vector<ScenarioEvent> messages = anyDrive(technology);
    const std::chrono::milliseconds shift(*rc::gen::inRange<std::int64_t>(-1'000'000'000, 1'000'000'000));
    RC_ASSERT(accountOf(technology, messages, FakeClock::defaultNow()) ==
              accountOf(technology, messages, FakeClock::defaultNow() + shift));
}

RC_GTEST_PROP(DriveEvents, OfAFileThatWasCutInTwoAreThoseOfTheWhole, ()) {
    const DecodedTechnology technology = anyTechnology();
    const std::vector<ScenarioEvent> messages = anyDrive(technology);
    const std::size_t cut = *rc::gen::inRange<std::size_t>(0, messages.size() + 1);
    // The second file has numbers of its own.
    class TwoFiles final : public ObservationSink {
    public:
        TwoFiles(const DecodedTechnology& decoded, std::size_t first)
            : technology(decoded), _first(first), _engine(technology.decoder().catalogue(), kept) {
            technology.decoder().setObservationSink(this);
        }
        ~TwoFiles() override { technology.decoder().setObservationSink(nullptr); }
        void observed(const ObservedMessage& message) override {
            const std::uint64_t number = ++_number;
            const bool isSecond = number > _first;
            _engine.report(
                {{isSecond ? 1U : 0U, isSecond ? number - _first : number}, message.arrival, message});
        }
        void finish() { _engine.finish(); }

        TechnologyUnderTest technology;
        KeptEvents kept;

    private:
        std::size_t _first;
        std::uint64_t _number = 0;
        EventEngine _engine;
    };
    TwoFiles files(technology, cut);
    for (const ScenarioEvent& each : messages) {
        files.technology.clock().setNow(FakeClock::defaultNow() + each.offset);
        files.technology.decoder().updateState(files.technology.state, each.message);
    }
    files.finish();
    RC_ASSERT(files.kept.lines(FakeClock::defaultNow()) ==
              eventsOf(technology, messages).lines(FakeClock::defaultNow()));
}

RC_GTEST_PROP(DriveEvents, AreWellFormed, ()) {
    const DecodedTechnology technology = anyTechnology();
    const std::vector<ScenarioEvent> messages = anyDrive(technology);
    const KeptEvents kept = eventsOf(technology, messages);
    for (const Event& each : kept.events) {
        const EventKindRow* const row = eventKindNamed(each.kind);
        RC_ASSERT(row != nullptr);
        RC_ASSERT(each.lasts == row->lasts);
        RC_ASSERT(each.lasts || !each.end);
        RC_ASSERT(!each.end || *each.end >= each.time);
        RC_ASSERT(!each.text.empty());
        RC_ASSERT(!each.evidence.empty() && each.evidence.size() <= Event::mostEvidence);
        RC_ASSERT(std::is_sorted(each.evidence.begin(), each.evidence.end()));
        RC_ASSERT(each.evidence.back().number <= messages.size());
    }
}

/// How many events there are of each kind.
std::map<std::string, std::size_t> countsOf(const KeptEvents& kept) {
    std::map<std::string, std::size_t> counts;
    for (const Event& each : kept.events)
        ++counts[each.kind];
    return counts;
}

class UnusualMessagesOfADrive : public testing::TestWithParam<DecodedTechnology> {};

/// Of the six kinds of unusual messages (Documentation/scenarios.md) the prefixed one and that of an unknown
/// code are well-formed.
TEST_P(UnusualMessagesOfADrive, AreFourInSixMalformed) {
    EngineUnderTest engine(GetParam());
    const std::unique_ptr<Scenario> scenario = scenarioKindNamed(GetParam().scenario)->make(1);
    std::size_t malformed = 0;
    std::map<std::string, std::size_t> reasons;
    for (int i = 0; i < 20000 && malformed < 8; ++i) {
        const ScenarioEvent each = scenario->next();
        engine.decode(each.message, FakeClock::defaultNow() + each.offset);
        malformed = countsOf(engine.kept)["malformed"];
    }
    for (const Event& each : engine.kept.events)
        if (each.kind == "malformed")
            ++reasons[std::get<std::string>(each.field("reason")->value)];
    // Two rounds of the four kinds.
    EXPECT_EQ(reasons["no record"], 2U);
    EXPECT_EQ(reasons["wrong type"], 2U);
    EXPECT_EQ(reasons["too short"] + reasons["unreadable"] + reasons["missing entries"], 4U);
}

INSTANTIATE_TEST_SUITE_P(OfTechnologies, UnusualMessagesOfADrive,
                         testing::Values(decodedTechnologies[0], decodedTechnologies[1],
                                         decodedTechnologies[2], decodedTechnologies[3],
                                         decodedTechnologies[5]),
                         [](const auto& drive) { return std::string(drive.param.scenario); });

/// What happens in the first round of the drives by Documentation/scenarios.md.
TEST(DriveEvents, OfGSMAreThoseOfItsRound) {
    const DecodedTechnology& gsm = decodedTechnologies[0];
    const std::vector<std::string> lines =
        eventsOf(gsm, messagesOf(gsm, 1, 7000)).lines(FakeClock::defaultNow());
    EXPECT_THAT(lines, Contains(testing::HasSubstr("call-setup")));
    EXPECT_THAT(lines, Contains(testing::HasSubstr("technology-change: GSM to UMTS")).Times(2));
    EXPECT_THAT(lines, Contains(testing::HasSubstr("technology-change: UMTS to GSM")).Times(2));
    EXPECT_THAT(lines, Contains(testing::HasSubstr("call-lost")).Times(0));
    EXPECT_THAT(lines, Contains(testing::HasSubstr("limited-service")).Times(1));
}

TEST(DriveEvents, OfIFXHaveOneCallARound) {
    const DecodedTechnology& ifx = decodedTechnologies[4];
    const std::vector<std::string> lines =
        eventsOf(ifx, messagesOf(ifx, 1, 150)).lines(FakeClock::defaultNow());
    EXPECT_THAT(lines, Contains("0.000 out-of-service: no service"));
    EXPECT_THAT(lines, Contains("6.000 limited-service: emergency calls alone"));
    EXPECT_THAT(lines, Contains("42.000 call-setup: connection active"));
    EXPECT_THAT(lines, Contains("72.000 call-end: connection ended"));
    EXPECT_THAT(lines, Contains("82.000 context-up: context 1: 192.0.2.17"));
    EXPECT_THAT(lines, Contains("107.000 context-down: context 1: 192.0.2.17"));
    EXPECT_THAT(lines, Contains("117.000 context-up: context 2: 2001:db8::17"));
}

} // namespace
} // namespace velmora

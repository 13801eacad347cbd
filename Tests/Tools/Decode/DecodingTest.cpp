// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Decoding.h"

#include "Platform/Console.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Tools/ToolFixture.h"
#include "Tools/Decode/FinalDisplay.h"
#include "Tools/Report.h"

#include <gmock/gmock.h>

#include <cstdio>
#include <deque>
#include <limits>
#include <map>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

/// Messages that the test has made, numbered from 1.
class ListReader final : public MessageReader {
public:
    /// The refreshes recorded in the file, by the number of the preceding message.
    std::map<std::uint64_t, Time> refreshes;

    ListReader(std::string technology, const std::vector<TimedMessage>& messages)
        : _technology(std::move(technology)), _messages(messages.begin(), messages.end()) {}

    [[nodiscard]] std::optional<LoggedMessage> next() override {
        if (_messages.empty())
            return std::nullopt;
        const TimedMessage message = _messages.front();
        _messages.pop_front();
        ++_number;
        LoggedMessage next{message.time, message.message, _number, 100 * _number};
        if (const auto refresh = refreshes.find(_number); refresh != refreshes.end())
            next.refresh = refresh->second;
        return next;
    }
    [[nodiscard]] const std::string& technology() const override { return _technology; }
    [[nodiscard]] const std::optional<Failure>& failure() const override { return _failure; }

private:
    std::string _technology;
    std::deque<TimedMessage> _messages;
    std::uint64_t _number = 0;
    std::optional<Failure> _failure;
};

class DecodingTest : public testing::Test {
protected:
    DecodingTest() {
        const DictionaryRef root = makeDictionary();
        root->set("GSM RR Info", makeDictionary());
        _resources.put("Ostrel_GSM", "plist", root);
    }
    ~DecodingTest() override { redirectConsole(_earlierConsole); }

    struct Refresh {
        Time tick;
        std::string state;
        friend bool operator==(const Refresh&, const Refresh&) = default;
    };

    struct Observer final : DecodingObserver {
        void didDecode(const LoggedMessage&, LogGenerator&, Dictionary&) override { ++messages; }
        void didRefresh(Time tick, const Decoded& decoded) override {
            const Dictionary* section = (*decoded.display.asDictionary())["GSM RR Info"].asDictionary();
            refreshes.push_back({tick, *(*section)["RR State"].asString()});
        }
        [[nodiscard]] bool isDone() const override { return messages >= mostMessages; }

        std::uint64_t mostMessages = std::numeric_limits<std::uint64_t>::max();
        std::uint64_t messages = 0;
        std::vector<Refresh> refreshes;
    };

    /// The refreshes of the messages, each with the RR State that it shows.
    static std::vector<Refresh> refreshesOf(const std::vector<TimedMessage>& messages,
                                            const TimeRange& range = {}) {
        return refreshesOf(messages, {}, range);
    }
    /// As above, where the file records refreshes: by the number of the preceding message.
    static std::vector<Refresh> refreshesOf(const std::vector<TimedMessage>& messages,
                                            std::map<std::uint64_t, Time> told, const TimeRange& range) {
        ListReader reader("Ostrel_GSM", messages);
        reader.refreshes = std::move(told);
        WorkContext context("test");
        Observer observer;
        const Result<DecodedFile> decoded =
            decodeMessages(reader, {{}, {range, false, {}}}, context, observer);
        EXPECT_TRUE(decoded);
        EXPECT_EQ(decoded->technologies.front().messages, observer.messages);
        return observer.refreshes;
    }

    static TimeRange rangeOf(std::optional<Time> from, std::optional<Time> to) {
        const auto bound = [](std::optional<Time> moment) {
            return moment ? std::optional(TimeBound{moment->time_since_epoch(), false}) : std::nullopt;
        };
        return {bound(from), bound(to)};
    }

    FakeResources _resources;
    std::FILE* _earlierConsole = redirectConsole(stderr);
};

TEST_F(DecodingTest, RefreshesAtTheTicksThatHaveHadMessages) {
    EXPECT_THAT(refreshesOf({
                    {at(0), rrState(4)},
                    {at(1999), rrState(5)},
                    {at(2000), rrState(0)}, // at the tick of 2 s: after it
                    {at(9000), rrState(1)}, // the ticks of 6 s and 8 s have had no messages
                    {at(10'000), rrState(2)},
                }),
                ElementsAre(Refresh{at(2000), "RR_IDLE"}, Refresh{at(4000), "RR_INACTIVE"},
                            Refresh{at(10'000), "RR_GOING_ACTIVE"},
                            Refresh{at(12'000), "RR_GOING_INACTIVE"}));
}

TEST_F(DecodingTest, KeepsTheHistoryForThoseWhoWantIt) {
    struct Ended final : DecodingObserver {
        explicit Ended(bool wanted) : wantsIt(wanted) {}
        [[nodiscard]] bool wantsHistory(std::uint64_t) const override { return wantsIt; }
        void didFinish(const LogGenerator&, const Dictionary& state) override {
            const Array* history = state["History"].asArray();
            entries = history ? history->size() : 0;
            hasRawMessages = state.contains("DisplayState");
        }
        bool wantsIt;
        bool hasRawMessages = false;
        std::size_t entries = 0;
    };
    for (const bool wanted : {false, true}) {
        ListReader reader("Ostrel_GSM", {{at(0), rrState(4)}, {at(2500), rrState(5)}});
        WorkContext context("test");
        Ended observer(wanted);
        ASSERT_TRUE(decodeMessages(reader, {}, context, observer));
        EXPECT_EQ(observer.entries, wanted ? 2u : 0u);
        EXPECT_EQ(observer.hasRawMessages, wanted);
    }
}

TEST_F(DecodingTest, OneMessageIsShownByTheLastTick) {
    EXPECT_THAT(refreshesOf({{at(0), rrState(5)}}), ElementsAre(Refresh{at(2000), "RR_IDLE"}));
}

TEST_F(DecodingTest, TimeStampsMayGoBackAndJumpAhead) {
    EXPECT_THAT(refreshesOf({{at(0), rrState(4)}, {Time::min(), rrState(0)}, {Time::max(), rrState(5)}}),
                ElementsAre(Refresh{at(2000), "RR_INACTIVE"}, Refresh{Time::max(), "RR_IDLE"}));
}

TEST_F(DecodingTest, RefreshesRecordedInTheFileReplaceTheTicks) {
    const std::vector<TimedMessage> messages = {{at(0), rrState(4)},
                                                {at(1000), rrState(5)},
                                                {at(7000), rrState(0)},
                                                {at(12'000), rrState(1)},
                                                {at(17'000), rrState(2)}};
    const std::map<std::uint64_t, Time> told = {{2, at(1500)}, {4, at(12'100)}, {5, at(17'100)}};
    EXPECT_THAT(refreshesOf(messages, told, {}),
                ElementsAre(Refresh{at(1500), "RR_IDLE"}, Refresh{at(12'100), "RR_GOING_ACTIVE"},
                            Refresh{at(17'100), "RR_GOING_INACTIVE"}));
    // A refresh whose latest message is outside the range shows the earlier ones; without any there is no
    // refresh.
    EXPECT_THAT(refreshesOf(messages, told, rangeOf(std::nullopt, at(1000))),
                ElementsAre(Refresh{at(1500), "RR_PLMN_LIST_CONSTRUCTION"}));
}

TEST_F(DecodingTest, MessagesOutsideTheRangeAreSkipped) {
    const std::vector<TimedMessage> messages = {
        {at(0), rrState(4)}, {at(1000), rrState(5)}, {at(2999), rrState(0)}, {at(3000), rrState(1)}};
    // The start belongs to the range and the end does not; ticks count from the first message inside.
    EXPECT_THAT(refreshesOf(messages, rangeOf(at(1000), at(3000))),
                ElementsAre(Refresh{at(3000), "RR_INACTIVE"}));
    EXPECT_THAT(refreshesOf(messages, rangeOf(at(3000), std::nullopt)),
                ElementsAre(Refresh{at(5000), "RR_GOING_ACTIVE"}));
    const std::chrono::nanoseconds second = std::chrono::seconds(1);
    EXPECT_THAT(refreshesOf(messages, {TimeBound{second, true}, TimeBound{2 * second, true}}),
                ElementsAre(Refresh{at(3000), "RR_IDLE"}));
    EXPECT_THAT(refreshesOf(messages, rangeOf(at(5000), std::nullopt)), IsEmpty());
}

TEST_F(DecodingTest, RestIsLeftUndoneOnceThereIsEnough) {
    ListReader reader("Ostrel_GSM", {{at(0), rrState(4)}, {at(1), rrState(5)}, {at(2), rrState(0)}});
    WorkContext context("test");
    Observer observer;
    observer.mostMessages = 2;
    const Result<DecodedFile> decoded = decodeMessages(reader, {}, context, observer);
    ASSERT_TRUE(decoded);
    EXPECT_EQ(decoded->technologies.front().messages, 2U);
    EXPECT_THAT(observer.refreshes, ElementsAre(Refresh{at(2000), "RR_IDLE"}));
}

TEST_F(DecodingTest, WithoutMessagesNothingIsRefreshedAndNothingShown) {
    ListReader reader("Ostrel_GSM", {});
    WorkContext context("test");
    Observer observer;
    const Result<DecodedFile> decoded = decodeMessages(reader, {}, context, observer);
    ASSERT_TRUE(decoded);
    EXPECT_THAT(observer.refreshes, IsEmpty());
    EXPECT_EQ(decoded->technologies.front().technology, "Ostrel_GSM");
    EXPECT_TRUE(decoded->technologies.front().display.isNone());
    EXPECT_EQ(FinalDisplay::text(decoded->technologies.front()), "");
}

TEST_F(DecodingTest, TechnologyIsShownInShort) {
    ListReader reader("", {{at(0), rrState(5)}});
    WorkContext context("test");
    Observer observer;
    const Result<DecodedFile> decoded =
        decodeMessages(reader, {"kVoxLogChannelTechnology_Ostrel_GSM", {}}, context, observer);
    ASSERT_TRUE(decoded);
    EXPECT_EQ(FinalDisplay::json(decoded->technologies.front()), R"({
  "technology": "Ostrel_GSM",
  "messages": 1,
  "display": {
    "GSM RR Info": {
      "RR State": "RR_IDLE",
      "RR Sub State": "0",
      "RR Status": "1",
      "RR Mode": "Voice"
    }
  }
}
)");
}

TEST(PlaceInFileTest, NamesTheRecordWhereThereIsOne) {
    EXPECT_EQ(positionInFile("drive.pcapng", 3, 1200), "drive.pcapng: record 3 at offset 1200");
    EXPECT_EQ(positionInFile("drive.pcapng", 0, 0), "drive.pcapng");
    EXPECT_EQ(fileTitle("-"), "standard input");
    EXPECT_EQ(fileTitle("a"), "a");
}

} // namespace
} // namespace velmora

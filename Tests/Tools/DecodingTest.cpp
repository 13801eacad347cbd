#include "Tools/Decoding.h"

#include "Platform/Console.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Tools/ToolFixture.h"
#include "Tools/DecodeCommand.h"
#include "Tools/Report.h"

#include <gmock/gmock.h>

#include <cstdio>
#include <deque>

namespace velmora {
namespace {

using testing::ElementsAre;

/// Messages that the test has made, numbered from 1.
class ListReader final : public MessageReader {
public:
    ListReader(std::string technology, std::vector<TimedMessage> messages)
        : _technology(std::move(technology)), _messages(messages.begin(), messages.end()) {}

    [[nodiscard]] std::optional<LoggedMessage> next() override {
        if (_messages.empty())
            return std::nullopt;
        const TimedMessage message = _messages.front();
        _messages.pop_front();
        ++_number;
        return LoggedMessage{message.time, message.message, _number, 100 * _number};
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

    /// The refreshes of the messages, each with the RR State that it shows.
    std::vector<Refresh> refreshesOf(const std::vector<TimedMessage>& messages) {
        ListReader reader("Ostrel_GSM", messages);
        WorkContext context("test");
        std::vector<Refresh> refreshes;
        const Result<Decoded> decoded =
            decodeMessages(reader, "", context, [&](Time tick, const Value& display) {
                const Dictionary* section = (*display.asDictionary())["GSM RR Info"].asDictionary();
                refreshes.push_back({tick, *(*section)["RR State"].asString()});
            });
        EXPECT_TRUE(decoded);
        EXPECT_EQ(decoded->messages, messages.size());
        return refreshes;
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

TEST_F(DecodingTest, OneMessageIsShownByTheLastTick) {
    EXPECT_THAT(refreshesOf({{at(0), rrState(5)}}), ElementsAre(Refresh{at(2000), "RR_IDLE"}));
}

TEST_F(DecodingTest, TimeStampsMayGoBackAndJumpAhead) {
    EXPECT_THAT(refreshesOf({{at(0), rrState(4)}, {Time::min(), rrState(0)}, {Time::max(), rrState(5)}}),
                ElementsAre(Refresh{at(2000), "RR_INACTIVE"}, Refresh{Time::max(), "RR_IDLE"}));
}

TEST_F(DecodingTest, WithoutMessagesNothingIsRefreshedAndNothingShown) {
    ListReader reader("Ostrel_GSM", {});
    WorkContext context("test");
    int refreshes = 0;
    const Result<Decoded> decoded =
        decodeMessages(reader, "", context, [&](Time, const Value&) { ++refreshes; });
    ASSERT_TRUE(decoded);
    EXPECT_EQ(refreshes, 0);
    EXPECT_EQ(decoded->technology, "Ostrel_GSM");
    EXPECT_TRUE(decoded->display.isNone());
    EXPECT_EQ(decodedText(*decoded), "");
}

TEST_F(DecodingTest, TechnologyIsShownInShort) {
    ListReader reader("", {{at(0), rrState(5)}});
    WorkContext context("test");
    const Result<Decoded> decoded = decodeMessages(reader, "kVoxLogChannelTechnology_Ostrel_GSM", context);
    ASSERT_TRUE(decoded);
    EXPECT_EQ(decodedJson(*decoded), R"({
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
    EXPECT_EQ(placeInFile("drive.pcapng", 3, 1200), "drive.pcapng: record 3 at offset 1200");
    EXPECT_EQ(placeInFile("drive.pcapng", 0, 0), "drive.pcapng");
    EXPECT_EQ(fileTitle("-"), "standard input");
    EXPECT_EQ(fileTitle("a"), "a");
}

} // namespace
} // namespace velmora

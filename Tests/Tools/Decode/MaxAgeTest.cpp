// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/Decode/Samples/SamplesFixture.h"

#include <gmock/gmock.h>

// `decode --max-age`: at a refresh, only what was reported recently.

namespace velmora {
namespace {

using testing::ElementsAre;

class MaxAgeTest : public SamplesTest {
protected:
    /// Every second an unknown message, so that there are refreshes.
    static std::vector<TimedMessage> withRefreshes(std::vector<TimedMessage> messages, int seconds) {
        for (int second = 1; second <= seconds; ++second)
            messages.push_back({at(second * 1000), record(0x1234, "")});
        std::stable_sort(messages.begin(), messages.end(),
                         [](const TimedMessage& a, const TimedMessage& b) { return a.time < b.time; });
        return messages;
    }
};

TEST_F(MaxAgeTest, OlderValuesAreLeftOut) {
    writeRecording("a.pcapng", "Ostrel_GSM", withRefreshes({{at(0), rrState(4)}, {at(6500), rrState(5)}}, 9));
    const std::vector<std::string> csv = {
        "decode", "--format", "csv", "--select", "s=/GSM RR Info/RR State", path("a.pcapng")};
    const auto second = [](int number) {
        return "2026-11-16T05:00:0" + std::to_string(number) + ".000000000Z,";
    };
    EXPECT_THAT(lines(run(csv)),
                ElementsAre("time,s", second(2) + "RR_PLMN_LIST_CONSTRUCTION",
                            second(4) + "RR_PLMN_LIST_CONSTRUCTION", second(6) + "RR_PLMN_LIST_CONSTRUCTION",
                            second(8) + "RR_IDLE", testing::EndsWith("RR_IDLE")));
    std::vector<std::string> aged = csv;
    aged.insert(aged.end(), {"--max-age", "4"});
    EXPECT_THAT(lines(run(aged)), ElementsAre("time,s", second(2) + "RR_PLMN_LIST_CONSTRUCTION",
                                              second(4) + "RR_PLMN_LIST_CONSTRUCTION", second(6),
                                              second(8) + "RR_IDLE", testing::EndsWith("RR_IDLE")));
}

TEST_F(MaxAgeTest, ListsLoseTheirRows) {
    const ArrayRef cells = makeArray();
    const DictionaryRef cell = makeDictionary();
    cell->set("ARFCN", "17");
    cell->set("RxLev", "-70 dBm");
    cells->append(cell);
    const DictionaryRef display = makeDictionary();
    display->set("Cells", cells);
    display->set("Band", "GSM 900");
    writeRecording("i.pcapng", "IFX", {{at(0), serialized(display)}});
    // The refresh is 2 s after it.
    EXPECT_THAT(
        run({"decode", "--format", "jsonl", "--max-age", "2", path("i.pcapng")}),
        testing::EndsWith(R"("display":{"Cells":[{"ARFCN":"17","RxLev":"-70 dBm"}],"Band":"GSM 900"}})"
                          "\n"));
    EXPECT_THAT(run({"decode", "--format", "jsonl", "--max-age", "1.9", path("i.pcapng")}),
                testing::EndsWith(R"("display":{"Cells":[]}})"
                                  "\n"));
}

TEST_F(MaxAgeTest, ValuesWithoutSectionsAreLeftOutToo) {
    writeRecording("c.pcapng", "Ostrel_CDMA",
                   withRefreshes({{at(0), record(0x108A, "00 00 00 00 00 00 00 00 00 00")}}, 5));
    ToolProcess::Setup setup = tool(
        {"decode", "--format", "csv", "--select", "f=/EV-DO/Fingers", "--max-age", "3", path("c.pcapng")});
    setup.environment["VELMORA_RESOURCES"] = VELMORA_SOURCE_DIR "/Resources";
    ToolProcess process(setup);
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_THAT(lines(process.output()),
                ElementsAre("time,f", "2026-11-16T05:00:02.000000000Z,(none)",
                            "2026-11-16T05:00:04.000000000Z,", "2026-11-16T05:00:06.000000000Z,"));
}

} // namespace
} // namespace velmora

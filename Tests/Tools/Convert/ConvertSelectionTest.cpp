// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/Convert/ConvertFixture.h"

#include <gmock/gmock.h>

// Which messages `convert` takes.

namespace velmora {
namespace {

class ConvertSelectionTest : public ConvertTest {};

TEST_F(ConvertSelectionTest, MessagesMayBeSelected) {
    struct Case {
        std::vector<std::string> options;
        std::vector<Data> expected;
    };
    const Case cases[] = {
        {{"--from", "+0.5"}, {_drive[1].message, _drive[2].message}},
        {{"--to", "+0.5"}, {_drive[0].message}},
        {{"--from", "2026-11-16T05:00:00.2Z", "--to", "2026-11-16T05:00:04Z"}, {_drive[1].message}},
        {{"--code", "0x512C"}, {_drive[0].message, _drive[2].message}},
        {{"--code", "0x512C", "--from", "+1"}, {_drive[2].message}},
        {{"--code", "0x512C", "--code", "16677"}, {_drive[0].message, _drive[1].message, _drive[2].message}},
    };
    for (const Case& row : cases)
        for (const std::string form : {".pcapng", ".velmora", ".dlf"}) {
            std::vector<std::string> arguments = row.options;
            arguments.insert(arguments.end(), {"--force", path("drive.pcapng"), path("out/part" + form)});
            EXPECT_EQ(convert(arguments, 0), "") << form;
            EXPECT_EQ(messagesOf("out/part" + form), row.expected)
                << form << testing::PrintToString(row.options);
        }
}

TEST_F(ConvertSelectionTest, WithoutASelectedMessageTheFileIsEmpty) {
    EXPECT_EQ(convert({"--code", "1", path("drive.pcapng"), path("out/none.pcapng")}, 0), "");
    EXPECT_THAT(messagesOf("out/none.pcapng"), testing::IsEmpty());
    EXPECT_EQ(convert({"--code", "1", path("drive.pcapng"), path("out/none.velmora")}, 0), "");
    EXPECT_THAT(messagesOf("out/none.velmora"), testing::IsEmpty());
}

TEST_F(ConvertSelectionTest, SnapshotOfLaterMessagesStartsCold) {
    EXPECT_EQ(convert({"--from", "+0.1", "--to", "+1", path("drive.pcapng"), path("out/part.velmora")}, 0),
              "");
    const Value list = snapshot("out/part.velmora");
    ASSERT_NE(list.asDictionary(), nullptr);
    // The grid begins at the first message that is selected, 0.5 s after the first of all.
    EXPECT_EQ((*list.asDictionary())["Timestamp"], Value("2026-11-16 05:00:02 +0000"));
    const Dictionary& entry = *(*(*list.asDictionary())["Data"].asArray())[0].asDictionary();
    EXPECT_EQ(entry["DisplayState"], Value(_drive[1].message));
    EXPECT_FALSE((*(*entry["Display"].asDictionary())["GSM RR Info"].asDictionary()).contains("RR State"));
}

TEST_F(ConvertSelectionTest, SnapshotLeavesOutWhatCannotBeDecoded) {
    const Data unreadable = record(0x0000, "DE AD BE EF", 0xFF);
    const auto offsets = writeRecording("sim.pcapng", "Ostrel_GSM",
                                        {{at(0), rrState(4)}, {at(500), unreadable}, {at(4100), unreadable}});
    const auto place = [&](int number) {
        return "velmora-log: " + path("sim.pcapng") + ": record " + std::to_string(number) + " at offset " +
               std::to_string(offsets[number - 1]) + ": SIM File dictionary data could not be constructed\n";
    };
    EXPECT_EQ(convert({path("sim.pcapng"), path("out/sim.velmora")}, 1),
              place(2) + place(3) + "velmora-log: " + path("sim.pcapng") +
                  ": 2 messages could not be decoded\n");
    const Value list = snapshot("out/sim.velmora");
    ASSERT_NE(list.asDictionary(), nullptr);
    // As the application refreshes whenever a message has arrived: at 2 s, and at 6 s with nothing new.
    EXPECT_EQ((*list.asDictionary())["Timestamp"], Value("2026-11-16 05:00:06 +0000"));
    const Array& data = *(*list.asDictionary())["Data"].asArray();
    ASSERT_EQ(data.size(), 3U);
    EXPECT_EQ((*data[0].asDictionary())["DisplayState"], Value(rrState(4)));
    EXPECT_EQ((*data[1].asDictionary())["DisplayState"], Value(Data()));
}

} // namespace
} // namespace velmora

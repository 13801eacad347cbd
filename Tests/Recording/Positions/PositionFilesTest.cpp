// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Pcapng/PcapngReader.h"
#include "Tests/Recording/PcapngWriterFixture.h"
#include "Tests/Support/ShellCommand.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <cerrno>
#include <chrono>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using testing::ElementsAre;

constexpr const char* sentence = "$GNGLL,4807.038,S,01131.000,W,123521,A,A*57\r\n";

/// "message 1" and "7 ns: sentence" in the file's order.
std::vector<std::string> contentOf(PcapngReader& reader) {
    std::vector<std::string> content;
    reader.setSentences([&](const PositionSentence& each) {
        content.push_back(std::to_string(each.time.time_since_epoch().count()) +
                          " ns: " + std::string(each.text));
    });
    while (const auto message = reader.next())
        content.push_back("message " + std::to_string(message->message.bytes()[0]));
    EXPECT_EQ(reader.lossTotals().losses, 0U);
    return content;
}

std::vector<std::string> contentOf(const std::string& path) {
    const auto reader = PcapngReader::open(path);
    EXPECT_TRUE(reader) << reader.reason();
    return contentOf(**reader);
}

class PositionFiles : public testing::Test {
protected:
    [[nodiscard]] std::string record(const char* name, std::string_view technology, std::uint8_t number,
                                     std::chrono::nanoseconds time) const {
        std::string path = directory / name;
        const auto writer = PcapngWriter::create(path, technology, PcapngWriter::Positions::With);
        EXPECT_TRUE(writer);
        EXPECT_TRUE((*writer)->appendSentence(Time(time), sentence));
        EXPECT_TRUE((*writer)->append(Time(time + std::chrono::seconds(2)), Bytes(&number, 1)));
        EXPECT_EQ((*writer)->messages(), 1U);
        EXPECT_TRUE((*writer)->close());
        return path;
    }

    TemporaryDirectory directory;
};

TEST_F(PositionFiles, areReadAsTheyWereWritten) {
    EXPECT_THAT(contentOf(record("a.pcapng", "Ostrel_GSM", 1, std::chrono::nanoseconds(7))),
                ElementsAre(std::string("7 ns: ") + sentence, "message 1"));
}

TEST_F(PositionFiles, areCutByCaptureTools) {
    NEEDS_PROGRAM("editcap");
    const std::string path = record("a.pcapng", "Ostrel_GSM", 1, std::chrono::nanoseconds(7));
    const std::string cut = directory / "cut.pcapng";
    ASSERT_EQ(runShell("editcap -r " + path + " " + cut + " 1").status, 0);
    EXPECT_THAT(contentOf(cut), ElementsAre(std::string("7 ns: ") + sentence));
    ASSERT_EQ(runShell("editcap -t 1 " + path + " " + cut).status, 0);
    EXPECT_THAT(contentOf(cut), ElementsAre(std::string("1000000007 ns: ") + sentence, "message 1"));
}

TEST_F(PositionFiles, areMergedByCaptureTools) {
    NEEDS_PROGRAM("mergecap");
    const std::string a = record("a.pcapng", "Ostrel_GSM", 1, std::chrono::nanoseconds(0));
    const std::string b = record("b.pcapng", "Ostrel_GSM", 2, std::chrono::seconds(1));
    const std::string merged = directory / "merged.pcapng";
    for (const char* const mode : {"none", "all", "any"}) {
        ASSERT_EQ(runShell("mergecap -I " + std::string(mode) + " -w " + merged + " " + a + " " + b).status,
                  0);
        EXPECT_THAT(contentOf(merged),
                    ElementsAre(std::string("0 ns: ") + sentence, std::string("1000000000 ns: ") + sentence,
                                "message 1", "message 2"))
            << mode;
    }
}

/// A recording with positions on a disk with errors.
class PositionWriter : public PcapngWriterFixture {
protected:
    void startWithPositions() {
        auto started = PcapngWriter::start(std::make_unique<FakeRecordingFile>(medium), "the recording",
                                           "Ostrel_GSM", PcapngWriter::Positions::With);
        ASSERT_TRUE(started) << started.reason();
        writer = *std::move(started);
    }
    [[nodiscard]] std::vector<std::string> content() const {
        const auto reader =
            PcapngReader::open(ChunkedInput(std::make_unique<MemorySource>(Data::copyOf(medium.content))));
        EXPECT_TRUE(reader);
        return contentOf(**reader);
    }
};

TEST_F(PositionWriter, hasTheInterfaceAtOnce) {
    start();
    const std::size_t without = medium.content.size();
    medium = {};
    startWithPositions();
    // 16 bytes, the name's option of 8, the resolution's of 8, the end's of 4, the length again.
    EXPECT_EQ(medium.content.size(), without + 40);
}

TEST_F(PositionWriter, doesNotCountSentencesAsMessages) {
    startWithPositions();
    EXPECT_TRUE(append(1));
    EXPECT_TRUE(writer->appendSentence(Time(std::chrono::nanoseconds(2)), sentence));
    EXPECT_EQ(writer->unsaved().messages, 1U);
    EXPECT_EQ(writer->unsaved().bytes, 1U);
    EXPECT_EQ(writer->messages(), 1U);
    EXPECT_TRUE(writer->close());
    EXPECT_THAT(content(), ElementsAre("message 1", std::string("2 ns: ") + sentence));
}

} // namespace
} // namespace velmora

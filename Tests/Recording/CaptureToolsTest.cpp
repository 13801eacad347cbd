// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Pcapng/PcapngReader.h"
#include "Recording/Pcapng/PcapngWriter.h"
#include "Tests/Recording/PcapngFile.h"
#include "Tests/Support/ShellCommand.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <chrono>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;

/// The field's capture tools on what we write, and we on what they write.
class CaptureTools : public testing::Test {
protected:
    [[nodiscard]] std::string record(const char* name, std::string_view technology,
                                     std::int64_t firstNanosecond,
                                     const std::vector<const char*>& messages) const {
        std::string path = _directory / name;
        auto writer = PcapngWriter::create(path, technology);
        EXPECT_TRUE(writer);
        for (const char* const message : messages) {
            EXPECT_TRUE(
                (*writer)->append(Time(std::chrono::nanoseconds(firstNanosecond)), hex(message).bytes()));
            firstNanosecond += 1'000'000'000;
        }
        EXPECT_TRUE((*writer)->close());
        return path;
    }

    /// "1 s ns: bytes" of each, offsets left aside: the tools add options of their own.
    [[nodiscard]] static std::vector<std::string> messagesOf(const std::string& path,
                                                             std::uint64_t losses = 0) {
        std::vector<std::string> texts;
        auto reader = PcapngReader::open(path);
        EXPECT_TRUE(reader) << reader.reason();
        while (const auto message = (*reader)->next())
            texts.push_back(std::to_string(message->number) + ", " +
                            std::to_string(message->time.time_since_epoch().count()) +
                            " ns: " + hexText(message->message.bytes()));
        EXPECT_EQ((*reader)->lossTotals().losses, losses);
        EXPECT_FALSE((*reader)->failure());
        return texts;
    }

    TemporaryDirectory _directory;
};

TEST_F(CaptureTools, showWhatARecordingIs) {
    NEEDS_PROGRAM("capinfos");
    const std::string path = record("a.pcapng", "Ostrel_GSM", 1'794'805'200'123'456'789, {"0102", "", "03"});
    const ShellOutcome outcome = runShell("capinfos " + path);
    EXPECT_EQ(outcome.status, 0);
    EXPECT_THAT(outcome.output, HasSubstr("File encapsulation:  USER 0"));
    EXPECT_THAT(outcome.output, HasSubstr("Number of packets:   3"));
    EXPECT_THAT(outcome.output, HasSubstr("File timestamp precision:  nanoseconds (9)"));
    EXPECT_THAT(outcome.output, HasSubstr("Capture application: Velmora " VELMORA_TEST_VERSION));
    EXPECT_THAT(outcome.output, HasSubstr("Number of interfaces in file: 1"));
    EXPECT_THAT(outcome.output, HasSubstr("Name = Ostrel_GSM"));
    EXPECT_THAT(outcome.output, HasSubstr("Encapsulation = USER 0"));
}

TEST_F(CaptureTools, listTheMessages) {
    NEEDS_PROGRAM("tshark");
    const std::string path = record("a.pcapng", "Ostrel_GSM", 1'794'805'200'123'456'789, {"0102", "AABBCC"});
    const ShellOutcome outcome =
        runShell("tshark -r " + path +
                 " -T fields -E separator=/s -e frame.number -e frame.time_epoch -e frame.len"
                 " -e frame.cap_len -e frame.interface_name");
    EXPECT_EQ(outcome.status, 0);
    EXPECT_EQ(outcome.output,
              "1 1794805200.123456789 2 2 Ostrel_GSM\n2 1794805201.123456789 3 3 Ostrel_GSM\n");
}

TEST_F(CaptureTools, cutARecording) {
    NEEDS_PROGRAM("editcap");
    const std::string path = record("a.pcapng", "Ostrel_LTE", 5, {"01", "02", "03", "04"});
    const std::string cut = _directory / "cut.pcapng";
    ASSERT_EQ(runShell("editcap -r " + path + " " + cut + " 2-3").status, 0);
    EXPECT_THAT(messagesOf(cut), ElementsAre("1, 1000000005 ns: 02", "2, 2000000005 ns: 03"));
    EXPECT_EQ((*PcapngReader::open(cut))->technology(), "Ostrel_LTE");
}

TEST_F(CaptureTools, shortenMessagesWhichAreThenLost) {
    NEEDS_PROGRAM("editcap");
    const std::string path = record("a.pcapng", "Ostrel_LTE", 5, {"01", "020202020202"});
    const std::string cut = _directory / "cut.pcapng";
    ASSERT_EQ(runShell("editcap -s 4 " + path + " " + cut).status, 0);
    EXPECT_THAT(messagesOf(cut, 1), ElementsAre("1, 5 ns: 01"));
}

TEST_F(CaptureTools, mergeRecordingsByTime) {
    NEEDS_PROGRAM("mergecap");
    const std::string a = record("a.pcapng", "Ostrel_LTE", 0, {"A1", "A2"});
    const std::string b = record("b.pcapng", "Ostrel_LTE", 500'000'000, {"B1", "B2"});
    const std::string merged = _directory / "merged.pcapng";
    for (const char* const mode : {"none", "all", "any"}) {
        ASSERT_EQ(runShell("mergecap -I " + std::string(mode) + " -w " + merged + " " + a + " " + b).status,
                  0);
        EXPECT_THAT(messagesOf(merged), ElementsAre("1, 0 ns: A1", "2, 500000000 ns: B1",
                                                    "3, 1000000000 ns: A2", "4, 1500000000 ns: B2"))
            << mode;
    }
}

TEST_F(CaptureTools, mergeTechnologiesOfWhichTheFirstIsRead) {
    NEEDS_PROGRAM("mergecap");
    const std::string a = record("a.pcapng", "Ostrel_LTE", 0, {"A1", "A2"});
    const std::string b = record("b.pcapng", "Ostrel_GSM", 500'000'000, {"B1"});
    const std::string merged = _directory / "merged.pcapng";
    ASSERT_EQ(runShell("mergecap -w " + merged + " " + a + " " + b).status, 0);
    EXPECT_THAT(messagesOf(merged, 1), ElementsAre("1, 0 ns: A1", "3, 1000000000 ns: A2"));
}

} // namespace
} // namespace velmora

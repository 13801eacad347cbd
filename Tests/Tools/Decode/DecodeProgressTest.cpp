// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/DecodeProgress.h"

#include "Tests/Support/FakeClock.h"
#include "Tests/Support/TemporaryDirectory.h"
#include "Tests/Tools/ToolFixture.h"

#include <gmock/gmock.h>

#include <chrono>
#include <csignal>
#include <cstdint>
#include <filesystem>
#include <fstream>
#include <vector>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using namespace std::chrono_literals;

constexpr std::uint64_t mebibyte = std::uint64_t{1} << 20;

TEST(DecodeProgressTest, ShowsPercentRateAndTimeLeft) {
    FakeClock clock;
    std::vector<std::string> lines;
    DecodeProgress progress(1000 * mebibyte, clock, [&](std::string_view line) { lines.emplace_back(line); });
    clock.advance(500ms);
    progress.at(mebibyte - 1); // too near to read the clock
    progress.at(50 * mebibyte);
    clock.advance(100ms);
    progress.at(60 * mebibyte); // too soon
    clock.advance(1400ms);
    progress.at(205 * mebibyte + 100);
    clock.advance(8s);
    progress.at(505 * mebibyte);
    clock.advance(100s);
    progress.at(515 * mebibyte);
    progress.at(2000 * mebibyte); // no time has gone by
    clock.advance(1s);
    progress.at(3000 * mebibyte); // a file that has grown
    EXPECT_THAT(lines, ElementsAre("0 %", "5 %, 100 MiB/s, 10 s left", "20 %, 102 MiB/s, 8 s left",
                                   "50 %, 50 MiB/s, 10 s left", "51 %, 4 MiB/s, 1 min 44 s left",
                                   "100 %, 9 MiB/s, 0 s left"));
}

TEST(DecodeProgressTest, AFileThatWasEmptyHasNoShares) {
    FakeClock clock;
    std::vector<std::string> lines;
    DecodeProgress progress(0, clock, [&](std::string_view line) { lines.emplace_back(line); });
    clock.advance(1s);
    progress.at(2 * mebibyte);
    EXPECT_THAT(lines, ElementsAre("0 %"));
}

TEST(DecodeProgressTest, OnlyFilesHaveASize) {
    const TemporaryDirectory directory;
    std::ofstream(directory / "five") << "bytes";
    EXPECT_EQ(inputSize((directory / "five").string()), 5U);
    EXPECT_EQ(inputSize((directory / "gone").string()), std::nullopt);
    EXPECT_EQ(inputSize("/dev/null"), std::nullopt);
    EXPECT_EQ(inputSize("/"), std::nullopt);
}

class DecodeProgressProgramTest : public ToolTest {
protected:
    /// This many MiB of messages without subscriber.
    void writeLargeRecording(const std::string& name, std::size_t mebibytes) const {
        const Data message(std::vector<std::uint8_t>(std::size_t{1} << 20, 0x01));
        writeRecording(name, "Ostrel_GSM", std::vector<TimedMessage>(mebibytes, {at(0), message}));
    }
};

TEST_F(DecodeProgressProgramTest, ProgressOfLongInputShowsOnATerminalAlone) {
    writeLargeRecording("long.pcapng", 65);
    writeLargeRecording("short.pcapng", 63);
    constexpr const char* shown = "0 %";
    constexpr const char* cleared = "\r\x1b[K";
    const auto errorsOf = [this](const std::string& file, bool onTerminal) {
        ToolProcess::Setup setup = tool({"decode", "--format", "csv", "--select", "/", path(file)});
        setup.errorsOnTerminal = onTerminal;
        ToolProcess process(setup);
        EXPECT_EQ(process.exitStatus(), 0);
        return process.errors();
    };
    const std::string errors = errorsOf("long.pcapng", true);
    EXPECT_THAT(errors, HasSubstr(shown));
    const std::size_t last = errors.rfind(" %");
    EXPECT_NE(errors.find(cleared, last), std::string::npos) << errors;
    EXPECT_EQ(errorsOf("long.pcapng", false).find(shown), std::string::npos);
    EXPECT_EQ(errorsOf("short.pcapng", true).find(shown), std::string::npos);
}

TEST_F(DecodeProgressProgramTest, ProgressShowsInTheHoleOfASparseFileAsWell) {
    writeLargeRecording("sparse.pcapng", 1);
    std::filesystem::resize_file(path("sparse.pcapng"), std::uintmax_t{12} << 30); // which takes no room
    ToolProcess::Setup setup = tool({"decode", path("sparse.pcapng")});
    setup.errorsOnTerminal = true;
    ToolProcess process(setup);
    ASSERT_TRUE(process.waitForError(" MiB/s, "));
    const auto begin = std::chrono::steady_clock::now();
    process.signal(SIGTERM);
    EXPECT_EQ(process.exitStatus(), 128 + SIGTERM);
    EXPECT_LT(std::chrono::steady_clock::now() - begin, std::chrono::seconds(1));
}

} // namespace
} // namespace velmora

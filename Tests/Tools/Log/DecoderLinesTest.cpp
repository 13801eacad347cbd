// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Log/DecoderLog.h"

#include "Tests/Support/CapturedLog.h"

#include <gmock/gmock.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

class DecoderLinesTest : public testing::Test {
protected:
    /// What the log gets of these lines, by a decoder, when they are reported.
    std::vector<std::string> reported(const std::vector<std::string>& texts, const std::string& title = {}) {
        {
            const DecoderLog log(_lines);
            for (const std::string& text : texts)
                logLine(LogPriority::Error, text);
        }
        EXPECT_THAT(_log.lines(), IsEmpty()) << "nothing is written before";
        _lines.report(title);
        return _log.textsAt(LogPriority::Error);
    }

    CapturedLog _log{LogPriority::Warning};
    DecoderLines _lines;
};

TEST_F(DecoderLinesTest, SumsUpByLogCodeInTheOrderOfTheFirstLines) {
    std::vector<std::string> lines(1'291, "Received an unknown log message: 45249");
    lines.insert(lines.begin() + 1, "Invalid log type: 2. Dropping.");
    lines.emplace_back("Received an unknown log message: 45250");
    lines.emplace_back("Invalid log type: 2. Dropping.");
    EXPECT_THAT(reported(lines), ElementsAre("1,291 messages of 0xB0C1: unknown log message",
                                             "2 times: Invalid log type: 2. Dropping.",
                                             "1 message of 0xB0C2: unknown log message"));
}

TEST_F(DecoderLinesTest, ALineOfItsOwnKeepsItsText) {
    EXPECT_THAT(reported({"ServingPLMN: Failed to retrieve MCC\n"}),
                ElementsAre("ServingPLMN: Failed to retrieve MCC"));
}

TEST_F(DecoderLinesTest, LinesThatDifferInNumbersAreOneKind) {
    EXPECT_THAT(reported({"Record 0x5137: 6 of 8 entries", "Record 0x5137: 1 of 12 entries",
                          "Record 0x5138: 6 of 8 entries", "Invalid log type: 2. Dropping.",
                          "Invalid log type: 5. Dropping."}),
                ElementsAre("2 messages of 0x5137, the first: 6 of 8 entries",
                            "1 message of 0x5138: 6 of 8 entries",
                            "2 times, the first: Invalid log type: 2. Dropping."));
}

TEST_F(DecoderLinesTest, LinesOfObjectsAreLeftOut) {
    EXPECT_THAT(reported({"Creating LTELogGenerator object", "Class Index: 1",
                          "LTELogGenerator is destructed 0x559cf6d3fdc0"}),
                IsEmpty());
}

TEST_F(DecoderLinesTest, TheTitleIsPutBeforeEachLine) {
    EXPECT_THAT(reported({"a", "a", "b"}, "drive.pcapng"),
                ElementsAre("drive.pcapng: 2 times: a", "drive.pcapng: b"));
}

TEST_F(DecoderLinesTest, AReportIsMadeOnce) {
    EXPECT_THAT(reported({"a"}), ElementsAre("a"));
    _lines.report();
    EXPECT_THAT(_log.textsAt(LogPriority::Error), ElementsAre("a"));
}

TEST_F(DecoderLinesTest, PrioritiesAreKindsOfTheirOwnAndTheLevelStillHolds) {
    {
        const DecoderLog log(_lines);
        logLine(LogPriority::Warning, "GSMRRInfo");
        logLine(LogPriority::Error, "GSMRRInfo");
        logLine(LogPriority::Notice, "not wanted");
    }
    _lines.report();
    EXPECT_THAT(_log.lines(), ElementsAre(CapturedLog::Line{LogPriority::Warning, "GSMRRInfo"},
                                          CapturedLog::Line{LogPriority::Error, "GSMRRInfo"}));
}

TEST_F(DecoderLinesTest, KindsAndTextsAreBounded) {
    std::vector<std::string> lines;
    for (std::size_t kind = 0; kind < DecoderLines::maximumKinds + 7; ++kind)
        lines.push_back(std::string(kind + 1, 'x'));
    lines.emplace_back("xx"); // of a kind that is kept
    lines.front() = std::string(10 * DecoderLines::maximumLength, 'y');
    const std::vector<std::string> report = reported(lines);
    ASSERT_EQ(report.size(), DecoderLines::maximumKinds + 1);
    EXPECT_EQ(report.front(), std::string(DecoderLines::maximumLength, 'y'));
    EXPECT_EQ(report.back(), "7 more log lines; -v writes all of them");
}

TEST_F(DecoderLinesTest, ReportsPassADecodersLogThatIsStillThere) {
    // As when a decoder ends the program.
    const DecoderLog log(_lines);
    logLine(LogPriority::Error, "a");
    _lines.report();
    EXPECT_THAT(_log.textsAt(LogPriority::Error), ElementsAre("a"));
}

TEST_F(DecoderLinesTest, VerboseWritesAllLinesAsTheyArise) {
    DecoderLines lines(true);
    {
        const DecoderLog log(lines);
        logLine(LogPriority::Error, "Creating LTELogGenerator object");
        logLine(LogPriority::Error, "Received an unknown log message: 45249");
        logLine(LogPriority::Error, "Received an unknown log message: 45249");
    }
    EXPECT_THAT(_log.textsAt(LogPriority::Error),
                ElementsAre("Creating LTELogGenerator object", "Received an unknown log message: 45249",
                            "Received an unknown log message: 45249"));
    lines.report();
    EXPECT_EQ(_log.lines().size(), 3U);
}

TEST_F(DecoderLinesTest, CountedLinesLeaveAProgressLineAlone) {
    testing::internal::CaptureStderr();
    {
        ProgressLine progress;
        progress.show("37 %");
        {
            const DecoderLog log(_lines);
            logLine(LogPriority::Error, "a");
        }
        progress.show("38 %");
        _lines.report();
    }
    EXPECT_EQ(testing::internal::GetCapturedStderr(), "37 %\r\x1b[K38 %\r\x1b[K");
    EXPECT_THAT(_log.textsAt(LogPriority::Error), ElementsAre("a"));
}

} // namespace
} // namespace velmora

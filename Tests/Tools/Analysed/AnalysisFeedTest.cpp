// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Analysed/AnalysedFiles.h"

#include "Platform/Linux/Files/FileResources.h"
#include "Tests/Recording/PcapngFile.h"
#include "Tests/Tools/ToolFixture.h"

#include <gmock/gmock.h>

#include <fstream>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

/// Notes what it gets, as lines.
class NotingAnalysis final : public MessageAnalysis {
public:
    NotingAnalysis(std::string technology, std::vector<std::string>& notes)
        : _technology(std::move(technology)), _notes(notes) {}

    void report(const MessageReport& report) override {
        note(std::to_string(report.message.input) + "/" + std::to_string(report.message.number) + " at " +
             std::to_string((report.time - at(0)) / std::chrono::milliseconds(1)) + " ms");
    }
    void reportUndecoded(const UndecodedReport& report) override {
        note("undecoded " + std::to_string(report.message.number) + " at " +
             std::to_string((report.time - at(0)) / std::chrono::milliseconds(1)) +
             " ms: " + std::string(report.reason));
    }
    void reportLoss(const InputLoss& loss) override {
        note("loss at " + std::to_string(loss.at.input) + "/" + std::to_string(loss.at.number) + ": " +
             std::string(loss.reason));
    }
    void finish() override { note("end"); }

private:
    void note(const std::string& text) { _notes.push_back(_technology + " " + text); }

    std::string _technology;
    std::vector<std::string>& _notes;
};

class AnalysisFeedTest : public ToolTest {
protected:
    AnalysisFeedTest() { setResources(&_resources); }
    ~AnalysisFeedTest() override { setResources(nullptr); }

    [[nodiscard]] MakeAnalysis noting() {
        return [this](const Catalogue& catalogue) {
            return std::make_unique<NotingAnalysis>(catalogue.technology(), _notes);
        };
    }
    /// Returns whether all was read.
    bool analyse(const std::vector<std::string>& names, const std::string& technology = {}) {
        AnalysisFeed feed(AnalysisClock::Arrival, noting());
        AnalysedInput input;
        for (const std::string& name : names)
            input.files.push_back(path(name));
        input.technology = technology;
        DecoderLines lines;
        const bool good = analyseFiles(input, feed, lines);
        feed.finish();
        return good;
    }

    FileResources _resources{{VELMORA_SOURCE_DIR "/Resources"}};
    std::vector<std::string> _notes;
};

TEST_F(AnalysisFeedTest, AnalysisOfATechnologyContinuesFromFileToFile) {
    writeRecording("a.pcapng", "Ostrel_GSM", {{at(0), rrState(4)}, {at(10), rrState(5)}});
    writeRecording("b.pcapng", "Ostrel_GSM", {{at(20), rrState(4)}});
    EXPECT_TRUE(analyse({"a.pcapng", "b.pcapng"}));
    EXPECT_THAT(_notes, ElementsAre("Ostrel_GSM 0/1 at 0 ms", "Ostrel_GSM 0/2 at 10 ms",
                                    "Ostrel_GSM 1/1 at 20 ms", "Ostrel_GSM end"));
}

TEST_F(AnalysisFeedTest, EachTechnologyHasItsAnalysis) {
    writeRecording("a.pcapng", "Ostrel_GSM", {{at(0), rrState(4)}});
    writeRecording("b.pcapng", "Ostrel_LTE", {{at(20), rrState(4)}});
    EXPECT_TRUE(analyse({"a.pcapng", "b.pcapng", "a.pcapng"}));
    EXPECT_THAT(_notes, ElementsAre("Ostrel_GSM 0/1 at 0 ms", "Ostrel_LTE 1/1 at 20 ms",
                                    "Ostrel_GSM 2/1 at 0 ms", "Ostrel_GSM end", "Ostrel_LTE end"));
}

TEST_F(AnalysisFeedTest, TechnologyCanBeOverridden) {
    writeRecording("a.pcapng", "Ostrel_GSM", {{at(0), rrState(4)}});
    EXPECT_TRUE(analyse({"a.pcapng"}, "Ostrel_LTE"));
    EXPECT_THAT(_notes, ElementsAre("Ostrel_LTE 0/1 at 0 ms", "Ostrel_LTE end"));
}

TEST_F(AnalysisFeedTest, OneOfSeveralTechnologiesCanBeChosen) {
    PcapngFile file;
    file.section().messageInterface("Ostrel_GSM").messageInterface("Ostrel_LTE");
    file.message(1, rrState(4).bytes(), 0)
        .message(2, rrState(4).bytes(), 1)
        .message(3, rrState(4).bytes(), 0);
    std::ofstream(path("both.pcapng"), std::ios::binary)
        .write(reinterpret_cast<const char*>(file.bytes().data()), static_cast<std::streamsize>(file.size()));
    EXPECT_TRUE(analyse({"both.pcapng"}, "Ostrel_LTE"));
    ASSERT_EQ(_notes.size(), 2U);
    EXPECT_THAT(_notes[0], testing::StartsWith("Ostrel_LTE 0/2 at"));
}

TEST_F(AnalysisFeedTest, LossesArePassedOnWhereTheyAre) {
    const std::vector<std::uint64_t> offsets = writeRecording(
        "a.pcapng", "Ostrel_GSM", {{at(0), rrState(4)}, {at(10), rrState(5)}, {at(20), rrState(4)}});
    {
        // The length of the second record's block.
        std::fstream file(path("a.pcapng"), std::ios::in | std::ios::out | std::ios::binary);
        file.seekp(static_cast<std::streamoff>(offsets[1] + 4));
        file.write("\xff\xff\xff\x7f", 4);
    }
    testing::internal::CaptureStderr();
    EXPECT_FALSE(analyse({"a.pcapng"}));
    EXPECT_THAT(testing::internal::GetCapturedStderr(), testing::HasSubstr("record 2 at offset"));
    ASSERT_EQ(_notes.size(), 4U);
    EXPECT_EQ(_notes[0], "Ostrel_GSM 0/1 at 0 ms");
    EXPECT_THAT(_notes[1], testing::StartsWith("Ostrel_GSM loss at 0/2: "));
    EXPECT_EQ(_notes[2], "Ostrel_GSM 0/2 at 20 ms"); // the number of a damaged block is unknown
}

TEST_F(AnalysisFeedTest, AMissingFileIsALossInBetween) {
    writeRecording("a.pcapng", "Ostrel_GSM", {{at(0), rrState(4)}});
    writeRecording("b.pcapng", "Ostrel_GSM", {{at(10), rrState(4)}});
    testing::internal::CaptureStderr();
    EXPECT_FALSE(analyse({"a.pcapng", "none.pcapng", "b.pcapng"}));
    EXPECT_THAT(testing::internal::GetCapturedStderr(), testing::HasSubstr("none.pcapng: cannot open"));
    EXPECT_THAT(_notes, ElementsAre("Ostrel_GSM 0/1 at 0 ms",
                                    "Ostrel_GSM loss at 1/1: cannot open: No such file or directory",
                                    "Ostrel_GSM 2/1 at 10 ms", "Ostrel_GSM end"));
}

TEST_F(AnalysisFeedTest, UndecodedMessagesAreReportedWithTheirTime) {
    const std::string noList = "no property list";
    const Data message = Data::copyOf({reinterpret_cast<const std::uint8_t*>(noList.data()), noList.size()});
    writeRecording("a.pcapng", "IFX", {{at(7), message}});
    testing::internal::CaptureStderr();
    EXPECT_FALSE(analyse({"a.pcapng"}));
    EXPECT_THAT(testing::internal::GetCapturedStderr(), testing::HasSubstr("1 message could not be decoded"));
    ASSERT_EQ(_notes.size(), 2U);
    EXPECT_THAT(_notes[0], testing::StartsWith("IFX undecoded 1 at 7 ms: "));
}

TEST_F(AnalysisFeedTest, AnUnknownTechnologyIsBadInput) {
    writeRecording("a.pcapng", "Other", {{at(7), rrState(4)}});
    testing::internal::CaptureStderr();
    EXPECT_FALSE(analyse({"a.pcapng"}));
    EXPECT_THAT(testing::internal::GetCapturedStderr(), testing::HasSubstr("\"Other\" is unknown"));
    EXPECT_THAT(_notes, IsEmpty());
}

} // namespace
} // namespace velmora

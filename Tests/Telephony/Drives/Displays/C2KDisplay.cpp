// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/TelephonyService.h"
#include "Tests/Telephony/Drives/C2KLayouts.h"
#include "Tests/Telephony/Drives/Displays/DisplayTesting.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <set>
#include <string>

namespace velmora {
namespace {

using namespace c2k;
using ::testing::MatchesRegex;

/// The scenario through the technology's decoder, with the template that is shipped.
class C2KDisplayTest : public DisplayTest {
protected:
    C2KDisplayTest() : DisplayTest(kVoxLogChannelTechnology_Ostrel_CDMA, "C2KTemplate") {
        static_cast<void>(decoder->generateLogUsingState(state)); // builds the display
    }

    /// Puts every text of the display under its path: "/1x/Channel". Pilots stand under their list's.
    static void collect(const Value& level, const std::string& path,
                        std::map<std::string, std::set<std::string>>& texts) {
        if (const std::string* text = level.asString())
            texts[path].insert(*text);
        if (const Dictionary* entries = level.asDictionary())
            for (const auto& [key, value] : *entries)
                if (key != "_sorted")
                    collect(value, key.find(';') == std::string::npos ? path + "/" + key : path, texts);
    }
};

TEST_F(C2KDisplayTest, onlyUnusualMessagesAreReported) {
    int reported = 0;
    for (const ScenarioEvent& event : twentyMinutes()) {
        const CapturedLog log(LogPriority::Warning);
        decoder->updateState(state, event.message);
        const auto header = LogMessage::parse(event.message.bytes());
        const bool odd =
            header && layouts.contains(header->logCode()) && (header->type == 2 || !isWellFormed(*header));
        EXPECT_EQ(!log.lines().empty(), odd) << (log.lines().empty() ? "" : log.lines()[0].text);
        reported += odd;
    }
    EXPECT_GE(reported, 40);
    EXPECT_LE(reported, 90);
}

TEST_F(C2KDisplayTest, everyLabelIsFilledAndPlausible) {
    std::map<std::string, std::set<std::string>> texts;
    std::size_t count = 0;
    for (const ScenarioEvent& event : twentyMinutes()) {
        decoder->updateState(state, event.message);
        if (++count % 10 == 0)
            collect(decoder->display(state), "", texts);
    }
    const char* const level = "[+-][0-9]+ dBm|N/A";
    const char* const fineLevel = "[+-][0-9]+\\.[0-9][0-9] dBm|N/A";
    const char* const rate = "[0-9]+\\.[0-9][0-9] kbps";
    const char* const band = "800 MHz cellular band .0.|1.8 to 2.0GHz PCS band .1.";
    const std::map<std::string, std::string> expected = {
        {"/Overview/1x State", "[A-Z].* .[0-9]+."},
        {"/Overview/EV-DO State", "[A-Z][a-z]+ .[0-5]."},
        {"/Overview/Roaming Indicator", "OFF .0.|Flashing .2."},
        {"/Overview/System ID", "3200[12]|.unknown system type 0."},
        {"/Overview/Network ID", "[12][12]|.unknown system type 0."},
        {"/Overview/Forward Link Rate", rate},
        {"/Overview/Reverse Link Rate", rate},
        {"/System/System ID", "3200[12]|.unknown system type 0."},
        {"/System/Network ID", "[12][12]|.unknown system type 0."},
        {"/System/Base Station ID", "[0-9]+"},
        {"/System/Packet Zone ID", "[0127]"},
        {"/System/Roaming Indicator", "OFF .0.|Flashing .2."},
        {"/System/Protocol Revision", "[06]"},
        {"/1x/Device State", "[A-Z].* .[0-9]+."},
        {"/1x/Band Class", band},
        {"/1x/Channel", "0|283|375"},
        {"/1x/Rx AGC", fineLevel},
        {"/1x/Tx AGC", fineLevel},
        {"/1x/Frame Error Rate", "[0-9]\\.[0-9][0-9]%|[0-9]\\.[0-9][0-9]% .old."},
        {"/1x/Active Set", "(.ref pilot. )?-[0-9]+\\.[0-9][0-9] dB"},
        {"/1x/Second Receiver/Band Class", "N/A|800 MHz cellular band .0.|1.8 to 2.0GHz PCS band .1."},
        {"/1x/Second Receiver/Channel", "N/A|283|375"},
        {"/1x/Second Receiver/Rx AGC", fineLevel},
        {"/EV-DO/Device State", "[A-Z][a-z]+ .[0-5]."},
        {"/EV-DO/Session State", "[A-Z].* .[0-4]."},
        {"/EV-DO/Band Class", band},
        {"/EV-DO/Channel", "0|78|425"},
        {"/EV-DO/Serving PN Offset", "Invalid Value|[0-9]+ \u00D7 64chips"},
        {"/EV-DO/Rx AGC 0", level},
        {"/EV-DO/Rx AGC 1", level},
        {"/EV-DO/Tx AGC", level},
        {"/EV-DO/Active Set", "[+-][0-9]+\\.[0-9][0-9] dB"},
        {"/EV-DO/Fingers", "[+-][0-9]+\\.[0-9][0-9] dB|.none."},
        {"/EV-DO/UATI 24", "0x[0-9a-f]+"},
        {"/EV-DO/Color Code", "0|4[127]"},
        {"/Data Rates/Forward Link", rate},
        {"/Data Rates/Reverse Link", rate},
    };
    std::set<std::string> labels;
    for (const auto& [label, seen] : texts) {
        labels.insert(label);
        ASSERT_TRUE(expected.contains(label)) << label;
        std::set<std::string> distinct = seen;
        distinct.erase("");
        EXPECT_GE(distinct.size(), 2U) << label << " never changes";
        for (const std::string& text : distinct)
            EXPECT_THAT(text, MatchesRegex(expected.at(label))) << label;
    }
    EXPECT_EQ(labels.size(), expected.size());
    // A call and a connection show both chains and the transmitters.
    for (const char* label :
         {"/1x/Tx AGC", "/1x/Second Receiver/Rx AGC", "/EV-DO/Rx AGC 1", "/EV-DO/Tx AGC"}) {
        EXPECT_TRUE(texts[label].contains("N/A")) << label;
        EXPECT_GE(texts[label].size(), 10U) << label;
    }
    double fastest = 0;
    for (const std::string& text : texts["/Data Rates/Forward Link"])
        if (!text.empty())
            fastest = std::max(fastest, std::stod(text));
    EXPECT_GE(fastest, 500);
    EXPECT_LE(fastest, 2500);
}

} // namespace
} // namespace velmora

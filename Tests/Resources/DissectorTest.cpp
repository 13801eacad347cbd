// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/LogMessage.h"
#include "Recording/OpenMessages.h"
#include "Tests/Recordings/ExampleRecording.h"
#include "Tests/Resources/Dissection.h"
#include "Tests/Resources/DissectorFixture.h"
#include "Tests/Support/Hex.h"
#include "Tests/Support/ShellCommand.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <map>
#include <string>
#include <vector>

/// What the Wireshark dissector makes of times, malformed messages and any other input.

namespace velmora {
namespace {

using testing::Each;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::Not;

struct TimeRow {
    const char* what;
    const char* stamp; ///< the record's bytes 5 to 12
    const char* shown;
};
const TimeRow timeRows[] = {
    {"beginning", "0000 000000000000", "Jan  6, 1980 00:00:00.000000000 UTC"},
    // 384 parts, 32 a chip of 813.8 ns.
    {"12 chips", "8001 000000000000", "Jan  6, 1980 00:00:00.000009766 UTC"},
    {"one unit", "0000 010000000000", "Jan  6, 1980 00:00:00.001250000 UTC"},
    {"last part of a second", "FFBF 1F0300000000", "Jan  6, 1980 00:00:00.999999975 UTC"},
    // The first leap second was inserted 542 days after the beginning: 46828800 s, of 800 units each.
    {"before a leap second", "0000 FF9FF8B80800", "Jun 30, 1981 23:59:59.998750000 UTC"},
    {"within a leap second", "0000 00A0F8B80800", "Jul  1, 1981 00:00:00.000000000 UTC"},
    {"after a leap second", "0000 20A3F8B80800", "Jul  1, 1981 00:00:00.000000000 UTC"},
};

TEST_F(Dissector, showsTimeStamps) {
    std::vector<Data> messages;
    for (const TimeRow& row : timeRows)
        messages.push_back(joined(hex("01 0C00 2C51"), hex(row.stamp)));
    const std::vector<std::string> found = dissectedFields(capture(messages), {"velmora.time"});
    ASSERT_EQ(found.size(), std::size(timeRows));
    for (std::size_t i = 0; i < found.size(); ++i)
        EXPECT_EQ(found[i], timeRows[i].shown) << timeRows[i].what;
}

struct OddRow {
    const char* what;
    const char* message;
    const char* expert;
    const char* info;
};
const OddRow oddRows[] = {
    {"good", "01 1000 2C51 0000000000000000 00000000", "", "0x512C  GSM RR Info  4 bytes"},
    {"below the least length of its code", "01 0F00 2C51 0000000000000000 000000",
     "Record 0x512C: 16 bytes, wanted at least 17", "0x512C  GSM RR Info  3 bytes"},
    {"more entries than it holds", "01 1000 0540 0000000000000000 00 01 0000",
     "Record 0x4005: 0 of 1 entries", "0x4005  GSM Set, UMTS Set  4 bytes"},
    {"extra stream without a list", "FF 0D00 0100 0000000000000000 77",
     "Property list cannot be read: 1 bytes that begin neither <?xml nor bplist00",
     "0xFF0001  GSM Serving Cell, Neighboring Cells, Serving PLMN, UMTS Set, UMTS RR Info  1 bytes"},
    {"code without a section", "01 0C00 7513 0000000000000000", "", "0x1375  0 bytes"},
    {"empty", "", "Message is too short: 0 bytes, wanted at least 13", "Empty"},
    {"12 bytes", "01 0C00 2C51 00000000000000", "Message is too short: 12 bytes, wanted at least 13",
     "Too short: 12 bytes, wanted at least 13"},
    {"prefixed", "8100 01 1000 2C51 0000000000000000 00000000", "", "0x512C  GSM RR Info  4 bytes, prefixed"},
    // As decoders do, the length is looked at before the prefix is taken away.
    {"prefixed, 13 bytes in all", "8100 01 0C00 2C51 000000000000",
     "Length is not the record's: 12, 10 bytes follow the type;"
     "Record ends within its time stamp: 11 bytes, wanted at least 13;"
     "Record 0x512C: 11 bytes, wanted at least 17",
     "0x512C  GSM RR Info  0 bytes, prefixed"},
    {"type 2", "02 0C00 2C51 0000000000000000", "Type is neither stream's: 0x02, wanted 0x01 or 0xff",
     "0x512C  [type 0x02]  0 bytes"},
    {"length", "01 0F00 2C51 0000000000000000 99000000",
     "Length is not the record's: 15, 16 bytes follow the type", "0x512C  GSM RR Info  4 bytes"},
    {"chips past their unit", "01 0C00 2C51 00C0 000000000000",
     "Time stamp is out of range: 0 units of 1.25 ms and 49152 of 49152 parts;"
     "Record 0x512C: 13 bytes, wanted at least 17",
     "0x512C  GSM RR Info  0 bytes"},
    {"time past the year 2262", "01 0C00 2C51 0000 FFFFFFFFFFFF",
     "Time stamp is out of range: 281474976710655 units of 1.25 ms and 0 of 49152 parts;"
     "Record 0x512C: 13 bytes, wanted at least 17",
     "0x512C  GSM RR Info  0 bytes"},
};

TEST_F(Dissector, marksMalformedMessages) {
    std::vector<Data> messages;
    for (const OddRow& row : oddRows)
        messages.push_back(hex(row.message));
    const std::string path = capture(messages);
    const std::vector<std::string> found =
        dissectedFields(path, {"_ws.expert.message", "_ws.col.Info", "_ws.col.Protocol"});
    ASSERT_EQ(found.size(), std::size(oddRows));
    for (std::size_t i = 0; i < found.size(); ++i)
        EXPECT_EQ(found[i], std::string(oddRows[i].expert) + "\t" + oddRows[i].info + "\tOstrel_GSM")
            << oddRows[i].what;
}

TEST_F(Dissector, marksMessagesTruncatedAtCapture) {
    NEEDS_PROGRAM("editcap");
    const std::string path = capture({hex("01 0C00 2C51 0000000000000000 01020304")});
    const std::string cut = _directory / "cut.pcapng";
    ASSERT_EQ(runShell("editcap -s 15 " + path + " " + cut).status, 0);
    const std::vector<std::string> found = dissectedFields(cut, {"velmora.payload", "_ws.expert.message"});
    EXPECT_THAT(found, ElementsAre(HasSubstr("Message was cut when it was captured: 15 of 17 bytes")));
    EXPECT_THAT(found, ElementsAre(HasSubstr("0102\t")));
}

TEST_F(Dissector, servesDisplayFilters) {
    const std::string path = VELMORA_SOURCE_DIR "/Tests/Recordings/lte.pcapng";
    const auto count = [&](const std::string& filter) {
        return dissected(path, "-Y " + shellQuoted(filter)).size();
    };
    const auto reader = openMessages(path);
    ASSERT_TRUE(reader) << reader.reason();
    std::size_t neighbours = 0;
    std::size_t sim = 0;
    std::size_t tooShort = 0;
    std::size_t weak = 0;
    while (const auto message = (*reader)->next()) {
        const auto header = LogMessage::parse(message->message.bytes());
        tooShort += header ? 0U : 1U;
        neighbours += header && header->logCode() == 0xB180 ? 1U : 0U;
        // Measured RSRP: nine bits from byte 21 on, a quarter of a dB each from -140 dBm.
        if (header && header->logCode() == 0xB17F && header->record.size() >= 33)
            weak += (header->record[21] + (header->record[22] & 1) * 256) * 0.25 - 140 < -105 ? 1U : 0U;
        sim += header && header->logCode() == 0xFF0000 ? 1U : 0U;
    }
    ASSERT_GT(neighbours, 0U);
    ASSERT_GT(sim, 0U);
    ASSERT_GT(tooShort, 0U);
    EXPECT_EQ(count("velmora.code == 0xb180"), neighbours);
    EXPECT_EQ(count("velmora.sections == \"Neighbor Cells List\""), neighbours);
    EXPECT_EQ(count("velmora.sections contains \"SIM\""), sim);
    EXPECT_EQ(count("velmora.too_short"), tooShort);
    ASSERT_GT(weak, 0U);
    EXPECT_EQ(count("velmora.lte.serving_cell_measurements.measured_rsrp < -105"), weak);
    EXPECT_EQ(count("velmora.technology != \"Ostrel_LTE\""), 0U);
}

TEST_F(Dissector, isLoadedFromTheDirectoryOfLuaPlugins) {
    const std::filesystem::path plugins = _directory / ".local/lib/wireshark/plugins";
    std::filesystem::create_directories(plugins);
    std::filesystem::copy_file(VELMORA_BUILD_DIR "/velmora.lua", plugins / "velmora.lua");
    const ShellOutcome outcome =
        runShell("HOME=" + shellQuoted(_directory.path()) + " tshark -r " +
                 capture({hex("01 0C00 2C51 0000000000000000")}) + " -T fields -e velmora.code");
    EXPECT_EQ(outcome.output, "0x00512c\n");
}

/// Every prefix of a good message, and every one of its bytes turned over: `dissected` expects the dissector
/// to bear it.
TEST_F(Dissector, acceptsAnyInput) {
    const Data good = hex("8100 FF 2E00 0000 0000000000000000 62706C6973743030 D1 01 02 51 61 51 62 08 0B 0D"
                          "000000000000 01 01 0000000000000003 0000000000000000 000000000000000F");
    std::vector<Data> messages;
    for (std::size_t size = 0; size <= good.size(); ++size)
        messages.push_back(Data::copyOf(good.bytes().first(size)));
    for (std::size_t i = 0; i < good.size(); ++i)
        for (const unsigned mask : {0x01U, 0x80U, 0xFFU}) {
            std::vector<std::uint8_t> bytes(good.bytes().begin(), good.bytes().end());
            bytes[i] = static_cast<std::uint8_t>(bytes[i] ^ mask);
            messages.emplace_back(std::move(bytes));
        }
    EXPECT_EQ(dissectedFields(capture(messages), {"frame.number"}).size(), messages.size());
    EXPECT_EQ(dissectedFields(capture(messages, "IFX"), {"frame.number"}).size(), messages.size());
    EXPECT_THAT(dissected(capture(messages), "-V"), Each(Not(HasSubstr("exception"))));
}

/// Records of every code, cut at every length and with bytes turned over: the counts in them, too.
TEST_F(Dissector, acceptsRecordsThatAreCutOrDamaged) {
    for (const ExampleRecording& recording : exampleRecordings()) {
        const auto reader = openMessages(VELMORA_SOURCE_DIR "/Tests/Recordings/" + recording.fileName());
        ASSERT_TRUE(reader) << reader.reason();
        std::vector<Data> messages;
        std::map<std::uint32_t, int> taken; // of each code
        while (const auto message = (*reader)->next()) {
            const Bytes good = message->message.bytes();
            const auto header = LogMessage::parse(good);
            if (++taken[header ? header->logCode() : 0] > 2)
                continue;
            const std::size_t step = std::max<std::size_t>(1, good.size() / 60);
            for (std::size_t size = 0; size < good.size(); size += step) {
                messages.push_back(Data::copyOf(good.first(size)));
                std::vector<std::uint8_t> bytes(good.begin(), good.end());
                bytes[size] = static_cast<std::uint8_t>(~bytes[size]);
                messages.emplace_back(std::move(bytes));
            }
        }
        const std::string path = capture(messages, (*reader)->technology());
        EXPECT_EQ(dissectedFields(path, {"frame.number"}).size(), messages.size());
        EXPECT_THAT(dissected(path, "-V"), Each(Not(HasSubstr("exception"))));
        EXPECT_THAT(dissected(capture(messages, ""), "-V"), Each(Not(HasSubstr("exception"))));
    }
}

} // namespace
} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/DLF/DLFReader.h"

#include "Tests/Recording/LogFile.h"

#include <algorithm>
#include <memory>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::ElementsAreArray;
using testing::IsEmpty;

// 2026-11-16 05:00:00 UTC as nanoseconds since 1970, and as a record's time stamp.
const std::string five = "1794805200000000000";
#define FIVE "000040329B741301"
// 1.25 ms later.
const std::string later = "1794805200001250000";
#define LATER "000041329B741301"

struct Case {
    const char* name;
    const char* records;               ///< behind the version report
    std::vector<std::string> messages; ///< less number, place and time
};

const Case cases[] = {
    {"OfARecord",
     R"(1000 2C51 )" FIVE R"( 04000100)", // length, code, time stamp, payload
     {"0110002C51" FIVE "04000100"}},
    {"OfABufferOfSeveral",
     R"(1000 2C51 )" FIVE R"( 04000100       // the first: no type byte
        01 0F00 3271 )" LATER R"( 010000     // the others keep theirs
        01 1000 2C51 )" LATER R"( 05000100)",
     {"0110002C51" FIVE "04000100", "010F003271" LATER "010000", "0110002C51" LATER "05000100"}},
    {"OfTwoBuffers",
     R"(1000 2C51 )" FIVE R"( 04000100
        01 0F00 3271 )" FIVE R"( 010000
        1000 2C51 )" LATER R"( 05000100
        01 0F00 3271 )" LATER R"( 020000)",
     {"0110002C51" FIVE "04000100", "010F003271" FIVE "010000", "0110002C51" LATER "05000100",
      "010F003271" LATER "020000"}},
    {"PrefixedInABuffer",
     R"(1000 2C51 )" FIVE R"( 04000100
        8171 01 0F00 3271 )" FIVE R"( 010000
        81FF FF 0E00 0200 )" LATER R"( 3C3E)",
     {"0110002C51" FIVE "04000100", "8171010F003271" FIVE "010000", "81FFFF0E000200" LATER "3C3E"}},
    {"PrefixedFirstOfABuffer",
     R"(71 01 0F00 3271 )" FIVE R"( 010000   // its 0x81 is gone
        01 1000 2C51 )" FIVE R"( 04000100
        01 01 0F00 3271 )" LATER R"( 010000)", // a prefix 0x81 0x01, of another buffer
     {"8171010F003271" FIVE "010000", "0110002C51" FIVE "04000100", "8101010F003271" LATER "010000"}},
    {"OfTheExtraStream",
     R"(0E00 0000 )" FIVE R"( 3C3E            // codes 0 to 2 without type byte
        1000 0100 )" FIVE R"( 62706C69
        0C00 0200 )" LATER R"(
        FF 0D00 0200 )" LATER R"( 3C)",
     {"FF0E000000" FIVE "3C3E", "FF10000100" FIVE "62706C69", "FF0C000200" LATER, "FF0D000200" LATER "3C"}},
    {"OfTheBasebandWithAnExtraCode", // told by its type byte alone
     R"(01 0D00 0100 )" FIVE R"( AA
        01 0F00 3271 )" FIVE R"( 010000)",
     {"010D000100" FIVE "AA", "010F003271" FIVE "010000"}},
    {"OfAWrongType",
     R"(1000 2C51 )" FIVE R"( 04000100
        02 0F00 3271 )" FIVE R"( 010000
        01 1000 2C51 )" LATER R"( 05000100)",
     {"0110002C51" FIVE "04000100", "020F003271" FIVE "010000", "0110002C51" LATER "05000100"}},
    {"OfUnknownCodes",
     R"(0F00 7513 )" FIVE R"( 010000
        0D00 7613 )" FIVE R"( AA
        01 0D00 7713 )" LATER R"( BB)",
     {"010F007513" FIVE "010000", "010D007613" FIVE "AA", "010D007713" LATER "BB"}},
    {"OfADayLater", // and a minute: 69,168,000 units of 1.25 ms
     R"(0F00 7513 )" FIVE R"( 010000
        0F00 7513 )" LATER R"( 020000
        0D00 7613 0000C09DBA781301 AA
        0D00 7713 0000C19DBA781301 BB)",
     {"010F007513" FIVE "010000", "010F007513" LATER "020000", "010D0076130000C09DBA781301AA",
      "010D0077130000C19DBA781301BB"}},
    {"WithoutTimes",
     R"(1000 2C51 0000000000000000 04000100
        01 0F00 3271 0000000000000000 010000
        0D00 7513 0000000000000000 AA)",
     {"0110002C51000000000000000004000100", "010F0032710000000000000000010000",
      "010D0075130000000000000000AA"}},
    {"WithTimesThatAreNone", // the lower 16 bits only go up to 0xBFFF
     R"(1000 2C51 00C040329B741301 04000100
        0F00 3271 00C040329B741301 010000)",
     {"0110002C5100C040329B74130104000100", "010F00327100C040329B741301010000"}},
};

std::vector<std::string> texts(const std::vector<std::string>& messages) {
    std::vector<std::string> parts;
    for (const std::string& message : messages)
        parts.push_back(message.substr(message.find(": ") + 2));
    return parts;
}

class DLFRecords : public testing::TestWithParam<Case> {};

TEST_P(DLFRecords, comeAsTheyArrived) {
    const ReadOut out = readAnyForm(joined(versionReport(), hex(GetParam().records)));
    EXPECT_THAT(texts(out.messages), ElementsAreArray(GetParam().messages));
    EXPECT_THAT(out.losses, IsEmpty());
    EXPECT_EQ(out.failure, "");
}

TEST_P(DLFRecords, comeInWhateverPiecesTheyAreRead) {
    const Data file = joined(versionReport(), hex(GetParam().records));
    const ReadOut whole = readAnyForm(file);
    for (const std::size_t piece : {1U, 2U, 3U, 7U, 13U})
        EXPECT_EQ(readAnyForm(file, piece).messages, whole.messages) << piece;
}

INSTANTIATE_TEST_SUITE_P(, DLFRecords, testing::ValuesIn(cases),
                         [](const auto& each) { return std::string(each.param.name); });

TEST(DLFReader, countsTheVersionReportAsARecord) {
    const ReadOut out = readAnyForm(joined(versionReport(), bareRecord(0x512C, "05000100", stampAfter(0)),
                                           versionReport(), // of a log appended to the first
                                           bareRecord(0x7132, "010000", stampAfter(1))));
    EXPECT_THAT(out.messages, ElementsAre("2 at 161, " + five + " ns: 0110002C51" FIVE "05000100",
                                          "4 at 338, " + later + " ns: 010F003271" LATER "010000"));
    EXPECT_EQ(out.technology, "Ostrel_GSM");
    EXPECT_THAT(out.losses, IsEmpty());
}

TEST(DLFReader, versionReportAloneIsALogWithoutMessages) {
    const ReadOut out = readAnyForm(versionReport());
    EXPECT_THAT(out.messages, IsEmpty());
    EXPECT_THAT(out.losses, IsEmpty());
    EXPECT_EQ(out.failure, "");
    EXPECT_EQ(out.technology, "");
}

TEST(DLFReader, takesLogsWithoutVersionReport) {
    const ReadOut out =
        readAnyForm(joined(bareRecord(0xB17F, "00", stampAfter(0)), bareRecord(0xB180, "00", stampAfter(1))));
    EXPECT_THAT(out.messages, ElementsAre("1 at 0, " + five + " ns: 010D007FB1" FIVE "00",
                                          "2 at 13, " + later + " ns: 010D0080B1" LATER "00"));
    EXPECT_EQ(out.technology, "Ostrel_LTE");
}

TEST(DLFReader, stampsThatAreNoTimeStandForTheLastOne) {
    const std::uint64_t none = stampAfter(7) | 0xFFFF;
    const auto timesOf = [](const Data& file) {
        std::vector<std::string> times;
        for (const std::string& message : readAnyForm(file).messages)
            times.push_back(
                message.substr(message.find(", ") + 2, message.find(" ns") - message.find(", ") - 2));
        return times;
    };
    const Data zero = bareRecord(0x512C, "05000100");
    const Data bad = bareRecord(0x512C, "05000100", none);
    const Data good = bareRecord(0x512C, "05000100", stampAfter(1));
    // First of all the time at which the log was written.
    EXPECT_THAT(timesOf(joined(versionReport(), zero, bad, good, zero, bad)),
                ElementsAre(five, five, later, later, later));
    // Without one, the beginning of system time: 1980-01-06.
    EXPECT_THAT(timesOf(joined(zero, bad, good, bad)),
                ElementsAre("315964800000000000", "315964800000000000", later, later));
    // A report that was written at no time is as none.
    const Data report = versionReport();
    std::vector<std::uint8_t> timeless(report.bytes().begin(), report.bytes().end());
    std::fill_n(timeless.begin() + 81, 4, std::uint8_t{0});
    EXPECT_THAT(timesOf(joined(Data(std::move(timeless)), zero, good)),
                ElementsAre("315964800000000000", later));
}

TEST(DLFReader, looksAMebibyteAheadForTheTechnology) {
    const Data nobodys = bareRecord(0x0001, std::string(120'000, '0'), stampAfter(0)); // 60012 bytes
    const Data some = bareRecord(0x512C, "05000100", stampAfter(1));
    const auto technologyBehind = [&](std::size_t records) {
        Data file = versionReport();
        std::vector<std::uint8_t> bytes(file.bytes().begin(), file.bytes().end());
        for (std::size_t i = 0; i < records; ++i)
            bytes.insert(bytes.end(), nobodys.bytes().begin(), nobodys.bytes().end());
        return readAnyForm(joined(Data(std::move(bytes)), some)).technology;
    };
    // 17 of them are 1020221 bytes with their type bytes, 18 are above the 1048576.
    EXPECT_EQ(technologyBehind(17), "Ostrel_GSM");
    EXPECT_EQ(technologyBehind(18), "");
}

/// The report, then records of 16, 16, 15 and 17 bytes at 161, 177, 193, 208: the last keeps its type byte.
Data fourRecords() {
    return joined(versionReport(), bareRecord(0x512C, "04000100", stampAfter(0)),
                  bareRecord(0x512C, "05000100", stampAfter(1)), bareRecord(0x7132, "010000", stampAfter(2)),
                  stampedRecord(0x512C, "04000100", stampAfter(3)));
}

const std::vector<std::string> fourTexts{
    "2 at 161, 1794805200000000000 ns: 0110002C51000040329B74130104000100",
    "3 at 177, 1794805200001250000 ns: 0110002C51000041329B74130105000100",
    "4 at 193, 1794805200002500000 ns: 010F003271000042329B741301010000",
    "5 at 208, 1794805200003750000 ns: 0110002C51000043329B74130104000100",
};

TEST(DLFReader, cutOffAtAnyByteOfTheLastTwoRecordsLosesOnlyWhatIsCut) {
    const Data whole = fourRecords();
    ASSERT_EQ(whole.size(), 225u);
    for (std::size_t size = 193; size <= 225; ++size) {
        const ReadOut out = readAnyForm(Data::copyOf(whole.bytes().first(size)));
        const std::size_t begin = size < 208 ? 193 : size < 225 ? 208 : 225;
        const auto kept = static_cast<std::ptrdiff_t>(size < 208 ? 2 : size < 225 ? 3 : 4);
        EXPECT_THAT(out.messages, ElementsAreArray(fourTexts.begin(), fourTexts.begin() + kept)) << size;
        if (size == begin) {
            EXPECT_THAT(out.losses, IsEmpty()) << size;
            continue;
        }
        const std::size_t left = size - begin;
        const std::size_t length = begin == 193 ? 15 : 17;
        // A record is known as one once its header is whole: 12 bytes, and a type byte before them.
        const std::size_t header = begin == 193 ? 12 : 13;
        const std::string reason =
            left < header
                ? std::to_string(left) + " bytes at the end, wanted a record of 12 at least"
                : "record cut off after " + std::to_string(left) + " of " + std::to_string(length) + " bytes";
        EXPECT_THAT(out.losses,
                    ElementsAre("at " + std::to_string(begin) + ", " + std::to_string(left) +
                                " bytes, record " + std::to_string(kept + 2) + ", tail: " + reason))
            << size;
    }
}

TEST(DLFReader, passesOverWhatIsNoRecord) {
    struct Damage {
        const char* name;
        Data file;
        std::vector<std::string> messages;
        std::vector<std::string> losses;
    };
    const Data first = bareRecord(0x512C, "04000100", stampAfter(0)); // 16 bytes at 161
    const Data last = bareRecord(0x7132, "010000", stampAfter(1));    // 15 bytes
    const std::string firstText = ", " + five + " ns: 0110002C51" FIVE "04000100";
    const std::string lastText = ", " + later + " ns: 010F003271" LATER "010000";
    const Damage damages[] = {
        {"rubbish between records",
         joined(versionReport(), first, hex("DEADBEEFDEADBEEF"), last),
         {"2 at 161" + firstText, "3 at 185" + lastText},
         {"at 177, 8 bytes, record 3: no log record"}},
        {"zeros between records",
         joined(versionReport(), first, Data(std::vector<std::uint8_t>(40)), last),
         {"2 at 161" + firstText, "3 at 217" + lastText},
         {"at 177, 40 bytes, record 3: no log record"}},
        {"a length that is too great",
         joined(versionReport(), first, hex("1300 2C51" FIVE "05000100"), last, last),
         {"2 at 161" + firstText, "3 at 193" + lastText, "4 at 208" + lastText},
         {"at 177, 16 bytes, record 3: record length 19 does not lead to another record"}},
        {"a length that reaches past the end",
         joined(versionReport(), first, hex("1070 2C51" FIVE "05000100"), last, last),
         {"2 at 161" + firstText, "3 at 193" + lastText, "4 at 208" + lastText},
         {"at 177, 16 bytes, record 3: record length 28688 does not lead to another record"}},
        {"a message that was cut short on its way, as the buffer has it",
         joined(versionReport(), first, hex("01 1000 2C51"), stampedRecord(0x7132, "010000", stampAfter(1))),
         {"2 at 161" + firstText, "3 at 182" + lastText},
         {"at 177, 5 bytes, record 3: record length 16 does not lead to another record"}},
        {"rubbish at the end",
         joined(versionReport(), first, hex("DEADBEEFDEADBEEFDEADBEEFDEADBEEFDEADBEEF")),
         {"2 at 161" + firstText},
         {"at 177, 20 bytes, record 3: no log record"}},
    };
    for (const Damage& each : damages) {
        const ReadOut out = readAnyForm(each.file);
        EXPECT_THAT(out.messages, ElementsAreArray(each.messages)) << each.name;
        EXPECT_THAT(out.losses, ElementsAreArray(each.losses)) << each.name;
        EXPECT_EQ(out.failure, "") << each.name;
    }
}

TEST(DLFReader, longDamageIsPassedInBoundedMemory) {
    std::vector<std::uint8_t> rubbish(3'000'000, 0x5A);
    const ReadOut out =
        readAnyForm(joined(versionReport(), bareRecord(0x512C, "04000100", stampAfter(0)),
                           Data(std::move(rubbish)), bareRecord(0x7132, "010000", stampAfter(1))));
    EXPECT_THAT(out.messages, ElementsAre("2 at 161, " + five + " ns: 0110002C51" FIVE "04000100",
                                          "3 at 3000177, " + later + " ns: 010F003271" LATER "010000"));
    EXPECT_THAT(out.losses, ElementsAre("at 177, 3000000 bytes, record 3: no log record"));
}

TEST(DLFReader, aReadErrorEndsIt) {
    const ReadOut out = readAnyForm(fourRecords(), SIZE_MAX, 200);
    EXPECT_THAT(out.messages, ElementsAre(fourTexts[0], fourTexts[1]));
    EXPECT_THAT(out.losses,
                ElementsAre("at 193, 7 bytes, record 4: 7 bytes at the end, wanted a record of 12 at least"));
    EXPECT_EQ(out.failure, "cannot read: Input/output error at offset 200");
}

/// So many records of these codes in turn.
Data recordsOf(std::initializer_list<std::uint16_t> codes, int rounds) {
    std::vector<std::uint8_t> bytes;
    std::uint64_t units = 0;
    for (int round = 0; round < rounds; ++round)
        for (const std::uint16_t code : codes) {
            const Data each = bareRecord(code, "0000", stampAfter(units++));
            bytes.insert(bytes.end(), each.bytes().begin(), each.bytes().end());
        }
    return Data(std::move(bytes));
}

TEST(DLFReader, tellsTheTechnologyFromTheLogCodes) {
    struct Told {
        const char* name;
        Data records;
        const char* technology;
    };
    const Told files[] = {
        {"each technology's own codes: GSM", recordsOf({0x512C}, 1), "Ostrel_GSM"},
        {"LTE", recordsOf({0xB0C1}, 1), "Ostrel_LTE"},
        {"UTRAN", recordsOf({0xD00A}, 1), "Ostrel_UTRAN2"},
        {"CDMA", recordsOf({0x1183}, 1), "Ostrel_CDMA"},
        {"nobody's code", recordsOf({0x1375}, 5), ""},
        {"several technologies' codes alone", recordsOf({0x0001, 0x0002}, 5), ""},
        {"several technologies' codes, and one's own at the end",
         joined(recordsOf({0x0001}, 50), recordsOf({0xD0E0}, 1)), "Ostrel_UTRAN2"},
        {"most messages decide", recordsOf({0x512C, 0xB17F, 0xB180}, 2), "Ostrel_LTE"},
        {"as many of two", recordsOf({0x512C, 0xB17F}, 2), ""},
        {"within 1000 messages", joined(recordsOf({0x1375}, 999), recordsOf({0xB17F}, 1)), "Ostrel_LTE"},
        {"not behind them", joined(recordsOf({0x1375}, 1000), recordsOf({0xB17F}, 1)), ""},
        {"three ahead is enough", joined(recordsOf({0x512C}, 3), recordsOf({0xB17F}, 100)), "Ostrel_GSM"},
    };
    for (const Told& each : files) {
        auto reader = DLFReader::open(ChunkedInput(std::make_unique<MemorySource>(each.records)));
        ASSERT_TRUE(reader) << each.name << ": " << reader.reason();
        EXPECT_EQ((*reader)->technology(), each.technology) << each.name;
        EXPECT_EQ((*reader)->form(), "DLF log");
        // What was looked at comes all the same, in its order.
        std::uint64_t number = 0;
        while (const auto message = (*reader)->next())
            EXPECT_EQ(message->number, ++number);
        EXPECT_EQ(number, each.records.size() / 14) << each.name;
        EXPECT_EQ((*reader)->technology(), each.technology) << each.name;
    }
}

} // namespace
} // namespace velmora

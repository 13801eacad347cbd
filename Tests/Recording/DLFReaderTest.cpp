// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/DLF/DLFReader.h"

#include "Tests/Recording/LogFile.h"

#include <algorithm>
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

TEST(DLFReader, invalidStampsTakeThePreviousTime) {
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

TEST(DLFReader, truncationInTheLastTwoRecordsLosesOnlyTheTruncatedOne) {
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
        // A record is recognised when its header is complete: 12 bytes, and a type byte before them.
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

} // namespace
} // namespace velmora

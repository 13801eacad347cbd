// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Pcapng/RecordingReader.h"

#include "Tests/Recording/PcapngFile.h"

#include <functional>
#include <memory>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

/// A section header, and an interface "Ostrel_GSM" that counts nanoseconds: 76 bytes.
constexpr const char* littleEndianHead = R"(
    0A0D0D0A 1C000000 4D3C2B1A 0100 0000 FFFFFFFFFFFFFFFF 1C000000
    01000000 30000000 9300 0000 00000000
        0200 0A00 4F737472656C5F47534D 0000
        0900 0100 09 000000
        0000 0000
    30000000)";
constexpr const char* bigEndianHead = R"(
    0A0D0D0A 0000001C 1A2B3C4D 0001 0000 FFFFFFFFFFFFFFFF 0000001C
    00000001 00000030 0093 0000 00000000
        0002 000A 4F737472656C5F47534D 0000
        0009 0001 09 000000
        0000 0000
    00000030)";

struct BlockCase {
    const char* name;
    const char* blocks; ///< what follows the little-endian head
    std::vector<std::string> messages;
    std::vector<std::string> losses;
};

/// Ends every case, to show that reading goes on: time 1 ns, "EE".
constexpr const char* lastMessage =
    "06000000 24000000 00000000 00000000 01000000 01000000 01000000 EE000000 24000000";

class OddBlocks : public testing::TestWithParam<BlockCase> {};

TEST_P(OddBlocks, areReadAsTheTableSays) {
    const Data file = joined(hex(littleEndianHead), hex(GetParam().blocks), hex(lastMessage));
    for (const std::size_t piece : {std::size_t{1}, std::size_t{7}, SIZE_MAX}) {
        const ReadOut out = readOut(file, piece);
        EXPECT_EQ(out.messages, GetParam().messages);
        EXPECT_EQ(out.losses, GetParam().losses);
        EXPECT_EQ(out.failure, "");
        EXPECT_EQ(out.technology, "Ostrel_GSM");
    }
}

const BlockCase blockCases[] = {
    {"NothingElse", "", {"1 at 76, 1 ns: EE"}, {}},
    {"EnhancedPacket",
     R"(06000000 24000000 00000000 01000000 02000000 04000000 04000000 01020304 24000000)",
     {"1 at 76, 4294967298 ns: 01020304", "2 at 112, 1 ns: EE"},
     {}},
    {"EnhancedPacketWithOptions",
     R"(06000000 30000000 00000000 00000000 02000000 03000000 03000000 01020300
        0100 0300 616263 00   # a comment
        0000 0000             # end
        30000000)",
     {"1 at 76, 2 ns: 010203", "2 at 124, 1 ns: EE"},
     {}},
    {"EmptyMessage",
     "06000000 20000000 00000000 00000000 02000000 00000000 00000000 20000000",
     {"1 at 76, 2 ns: ", "2 at 108, 1 ns: EE"},
     {}},
    {"SimplePacketHasTheTimeOfTheMessageBefore",
     R"(06000000 20000000 00000000 00000000 09000000 00000000 00000000 20000000
        03000000 14000000 02000000 01020000 14000000)",
     {"1 at 76, 9 ns: ", "2 at 108, 9 ns: 0102", "3 at 128, 1 ns: EE"},
     {}},
    {"SimplePacketOfMoreThanItsBlockHolds",
     "03000000 14000000 05000000 01020304 14000000",
     {"2 at 96, 1 ns: EE"},
     {"at 76, 20 bytes, record 1: message of 5 bytes in a block with room for 4"}},
    {"SimplePacketWithoutFields",
     "03000000 0C000000 0C000000",
     {"2 at 88, 1 ns: EE"},
     {"at 76, 12 bytes, record 1: packet block of 12 bytes, wanted 16 at least"}},
    {"ObsoletePacket",
     R"(02000000 24000000 0000 0500 00000000 07000000 02000000 02000000 01020000 24000000)",
     {"1 at 76, 7 ns: 0102", "2 at 112, 1 ns: EE"},
     {}},
    {"NameResolution", "04000000 10000000 00000000 10000000", {"1 at 92, 1 ns: EE"}, {}},
    {"InterfaceStatistics",
     "05000000 18000000 00000000 00000000 01000000 18000000",
     {"1 at 100, 1 ns: EE"},
     {}},
    {"DecryptionSecrets", "0A000000 14000000 4B534C54 00000000 14000000", {"1 at 96, 1 ns: EE"}, {}},
    {"Custom", "AD0B0000 14000000 01000000 DEADBEEF 14000000", {"1 at 96, 1 ns: EE"}, {}},
    {"CustomNotCopied", "AD0B0040 10000000 01000000 10000000", {"1 at 92, 1 ns: EE"}, {}},
    {"Unknown", "78563412 0C000000 0C000000", {"1 at 88, 1 ns: EE"}, {}},
    {"SecondSectionOfTheOtherByteOrder",
     R"(0A0D0D0A 0000001C 1A2B3C4D 0001 0002 0000000000000000 0000001C
        00000001 00000014 0093 0000 00000000 00000014
        00000006 00000024 00000000 00000000 00000002 00000001 00000001 AA000000 00000024
        0A0D0D0A 1C000000 4D3C2B1A 0100 0000 FFFFFFFFFFFFFFFF 1C000000
        01000000 1C000000 9300 0000 00000000 0900 0100 09 000000 1C000000)",
     {"1 at 124, 2000 ns: AA", "2 at 216, 1 ns: EE"},
     {}},
    {"SectionForgetsTheInterfacesBeforeIt",
     "0A0D0D0A 1C000000 4D3C2B1A 0100 0000 FFFFFFFFFFFFFFFF 1C000000",
     {},
     {"at 104, 36 bytes, record 1: message of interface 0, of which the section has 0"}},
    {"SectionOfALaterFormat",
     R"(0A0D0D0A 1C000000 4D3C2B1A 0200 0000 FFFFFFFFFFFFFFFF 1C000000
        01000000 1C000000 9300 0000 00000000 0900 0100 09 000000 1C000000)",
     {"1 at 132, 1 ns: EE"},
     {"at 76, 28 bytes, record 1: section of format version 2, wanted 1"}},
    {"InterfaceWithoutItsFields",
     R"(01000000 0C000000 0C000000
        06000000 24000000 01000000 00000000 01000000 01000000 01000000 AA000000 24000000)",
     {"2 at 124, 1 ns: EE"},
     {"at 76, 12 bytes, record 1: description of interface 1 does not hold its fields",
      "at 88, 36 bytes, record 1: message of interface 1, whose description was not readable"}},
    {"InterfaceThatIsNotThere",
     "06000000 24000000 07000000 00000000 01000000 01000000 01000000 AA000000 24000000",
     {"2 at 112, 1 ns: EE"},
     {"at 76, 36 bytes, record 1: message of interface 7, of which the section has 1"}},
    {"MessageCutByTheCapture",
     "06000000 24000000 00000000 00000000 01000000 01000000 00010000 AA000000 24000000",
     {"2 at 112, 1 ns: EE"},
     {"at 76, 36 bytes, record 1: message cut short when it was captured: 1 of 256 bytes"}},
    {"MessageThatDoesNotFitItsBlock",
     "06000000 24000000 00000000 00000000 01000000 05000000 05000000 AA000000 24000000",
     {"2 at 112, 1 ns: EE"},
     {"at 76, 36 bytes, record 1: message of 5 bytes in a block with room for 4"}},
    {"MessageOf4GiB",
     "06000000 24000000 00000000 00000000 01000000 FFFFFFFF FFFFFFFF AA000000 24000000",
     {"2 at 112, 1 ns: EE"},
     {"at 76, 36 bytes, record 1: message of 4294967295 bytes in a block with room for 4"}},
    {"EnhancedPacketWithoutFields",
     "06000000 1C000000 00000000 00000000 01000000 00000000 1C000000",
     {"2 at 104, 1 ns: EE"},
     {"at 76, 28 bytes, record 1: packet block of 28 bytes, wanted 32 at least"}},
    {"TimeStampPastAllTime",
     "06000000 24000000 00000000 FFFFFFFF FFFFFFFF 01000000 01000000 AA000000 24000000",
     {"2 at 112, 1 ns: EE"},
     {"at 76, 36 bytes, record 1: time stamp 18446744073709551615 lies outside of the years 1678 to 2262"}},
};

INSTANTIATE_TEST_SUITE_P(Table, OddBlocks, testing::ValuesIn(blockCases),
                         [](const auto& row) { return std::string(row.param.name); });

TEST(RecordingReader, readsBigEndianRecordings) {
    const ReadOut out = readOut(joined(hex(bigEndianHead), hex(R"(
        00000006 00000024 00000000 00000001 00000002 00000004 00000004 01020304 00000024
        00000003 00000014 00000001 AA000000 00000014
        00000002 00000024 0000 0005 00000000 00000007 00000001 00000001 BB000000 00000024)")));
    EXPECT_THAT(out.messages, ElementsAre("1 at 76, 4294967298 ns: 01020304", "2 at 112, 4294967298 ns: AA",
                                          "3 at 132, 7 ns: BB"));
    EXPECT_THAT(out.losses, IsEmpty());
    EXPECT_EQ(out.technology, "Ostrel_GSM");
}

TEST(RecordingReader, knowsTheTechnologyBeforeTheFirstMessage) {
    auto reader = RecordingReader::open(
        ChunkedInput(std::make_unique<MemorySource>(PcapngFile().head().message(1, {}).data())));
    ASSERT_TRUE(reader);
    EXPECT_EQ((*reader)->technology(), "Ostrel_GSM");
}

TEST(RecordingReader, takesTheServicesConstantForTheShortName) {
    const ReadOut out =
        readOut(PcapngFile().section().messageInterface("kVoxLogChannelTechnology_Ostrel_LTE").data());
    EXPECT_EQ(out.technology, "Ostrel_LTE");
}

TEST(RecordingReader, leavesTheTechnologyOpenWhereNoInterfaceIsNamed) {
    const ReadOut out =
        readOut(PcapngFile().section().messageInterface("").message(1, hex("AA").bytes()).data());
    EXPECT_EQ(out.technology, "");
    EXPECT_THAT(out.messages, ElementsAre("1 at 60, 1 ns: AA"));
    EXPECT_THAT(out.losses, IsEmpty());
}

TEST(RecordingReader, takesTheFirstTechnologyNamedAndLosesTheOthers) {
    PcapngFile file;
    file.section().messageInterface("").messageInterface("Ostrel_LTE").messageInterface("Ostrel_GSM");
    file.messageInterface("Ostrel_LTE");
    ASSERT_EQ(file.size(), 28U + 32U + 3 * 48U);
    for (std::uint32_t interface = 0; interface < 4; ++interface)
        file.message(interface, hex("AA").bytes(), interface);
    const ReadOut out = readOut(file.data());
    EXPECT_EQ(out.technology, "Ostrel_LTE");
    EXPECT_THAT(out.messages, ElementsAre("1 at 204, 0 ns: AA", "2 at 240, 1 ns: AA", "4 at 312, 3 ns: AA"));
    EXPECT_THAT(
        out.losses,
        ElementsAre("at 276, 36 bytes, record 3: message of Ostrel_GSM in a recording of Ostrel_LTE"));
}

TEST(RecordingReader, passesOverInterfacesOfOtherLinkTypes) {
    PcapngFile file;
    file.section().interface(1).message(1, hex("AA").bytes()).messageInterface("Ostrel_LTE");
    file.message(2, hex("BB").bytes(), 1).message(3, hex("CC").bytes(), 0);
    const ReadOut out = readOut(file.data());
    EXPECT_EQ(out.technology, "Ostrel_LTE");
    EXPECT_THAT(out.messages, ElementsAre("2 at 132, 2 ns: BB"));
    EXPECT_THAT(out.losses, IsEmpty());
    EXPECT_EQ(out.passedOver.interfaces, 1U);
    EXPECT_EQ(out.passedOver.packets, 2U);
}

TEST(RecordingReader, losesInterfacesAboveTheirBound) {
    PcapngFile file;
    file.head(); // the first interface
    for (int i = 1; i < 65'536; ++i)
        file.interface(1); // 20 bytes each
    file.interface(1).message(5, hex("0A0B").bytes());
    const ReadOut out = readOut(file.data());
    EXPECT_THAT(out.losses,
                ElementsAre("at 1310776, 20 bytes, record 1: more than 65536 interfaces in a section"));
    EXPECT_THAT(out.messages, ElementsAre("1 at 1310796, 5 ns: 0A0B"));
    EXPECT_EQ(out.passedOver.interfaces, 65'535u);
}

TEST(RecordingReader, cutsSimplePacketsAtTheSnapshotLength) {
    PcapngFile file;
    file.section().interface(147, {}, 4);
    file.block(3, hex("04000000 01020304").bytes()).block(3, hex("06000000 01020304").bytes());
    const ReadOut out = readOut(file.data());
    EXPECT_THAT(out.messages, ElementsAre("1 at 48, 0 ns: 01020304"));
    EXPECT_THAT(out.losses, ElementsAre("at 68, 20 bytes, record 2: message cut short when it was captured: "
                                        "4 of 6 bytes"));
}

TEST(RecordingReader, countsMicrosecondsWhereTheResolutionIsNotGiven) {
    const ReadOut out = readOut(PcapngFile().section().interface(147).message(3, hex("AA").bytes()).data());
    EXPECT_THAT(out.messages, ElementsAre("1 at 48, 3000 ns: AA"));
}

TEST(RecordingReader, losesMessagesAbove16MiB) {
    PcapngFile file;
    file.head().message(1, std::vector<std::uint8_t>(16'777'217)).message(2, hex("AA").bytes());
    const ReadOut out = readOut(file.data());
    // 16777220 padded bytes in a block of 32 more
    EXPECT_THAT(out.losses, ElementsAre("at 76, 16777252 bytes, record 1: message of 16777217 bytes, "
                                        "wanted at most 16777216"));
    EXPECT_THAT(out.messages, ElementsAre("2 at 16777328, 2 ns: AA"));
}

TEST(RecordingReader, keepsTheFirstHundredLossesAndCountsAll) {
    PcapngFile file;
    file.head();
    for (std::uint64_t i = 0; i < 250; ++i)
        file.message(i, hex("AA").bytes(), 9);
    auto reader = RecordingReader::open(ChunkedInput(std::make_unique<MemorySource>(file.data())));
    ASSERT_TRUE(reader);
    EXPECT_FALSE((*reader)->next());
    ASSERT_EQ((*reader)->losses().size(), 100U);
    EXPECT_EQ((*reader)->losses().back().recordNumber, 100U);
    EXPECT_EQ((*reader)->lossTotals().losses, 250U);
    EXPECT_EQ((*reader)->lossTotals().bytes, 250U * 36U);
}

TEST(RecordingReader, opensNoFileThatIsNotThere) {
    const auto none = RecordingReader::open("none.pcapng");
    ASSERT_FALSE(none);
    EXPECT_EQ(none.reason(), "cannot open: No such file or directory");
}

TEST(RecordingReader, tellsAReadErrorApartFromTheEnd) {
    const Data file = PcapngFile().head().message(1, hex("AA").bytes()).message(2, hex("BB").bytes()).data();
    const ReadOut between = readOut(file, SIZE_MAX, 112);
    EXPECT_THAT(between.messages, ElementsAre("1 at 76, 1 ns: AA"));
    EXPECT_THAT(between.losses, IsEmpty());
    EXPECT_EQ(between.failure, "cannot read: Input/output error at offset 112");

    const ReadOut within = readOut(file, SIZE_MAX, 120);
    EXPECT_THAT(within.messages, ElementsAre("1 at 76, 1 ns: AA"));
    EXPECT_EQ(within.failure, "cannot read: Input/output error at offset 120");
    EXPECT_THAT(within.losses,
                ElementsAre("at 112, 8 bytes, record 2: block header cut off after 8 of 12 bytes"));

    const ReadOut atOnce = readOut(file, SIZE_MAX, 0);
    EXPECT_EQ(atOnce.failure, "cannot read: Input/output error at offset 0");
}

TEST(RecordingReader, givesMessagesThatOutliveIt) {
    PcapngFile file;
    file.head();
    for (std::uint32_t i = 0; i < 5'000; ++i)
        file.message(i, file.number(i, 4).bytes());
    std::vector<Data> held;
    {
        auto reader = RecordingReader::open(ChunkedInput(std::make_unique<MemorySource>(file.data()), 8192));
        ASSERT_TRUE(reader);
        while (auto message = (*reader)->next())
            held.push_back(message->message);
    }
    ASSERT_EQ(held.size(), 5'000U);
    for (std::uint32_t i = 0; i < held.size(); ++i)
        ASSERT_TRUE(held[i] == file.number(i, 4)) << i;
}

} // namespace
} // namespace velmora

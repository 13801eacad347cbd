// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Pcapng/PcapngReader.h"

#include "Tests/Recording/PcapngFile.h"

#include <memory>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

/// A section header, and an interface "Ostrel_GSM" that counts nanoseconds: 76 bytes.
constexpr const char* bigEndianHead = R"(
    0A0D0D0A 0000001C 1A2B3C4D 0001 0000 FFFFFFFFFFFFFFFF 0000001C
    00000001 00000030 0093 0000 00000000
        0002 000A 4F737472656C5F47534D 0000
        0009 0001 09 000000
        0000 0000
    00000030)";

TEST(PcapngReader, readsBigEndianRecordings) {
    const ReadOut out = readOut(joined(hex(bigEndianHead), hex(R"(
        00000006 00000024 00000000 00000001 00000002 00000004 00000004 01020304 00000024
        00000003 00000014 00000001 AA000000 00000014
        00000002 00000024 0000 0005 00000000 00000007 00000001 00000001 BB000000 00000024)")));
    EXPECT_THAT(out.messages, ElementsAre("1 at 76, 4294967298 ns: 01020304", "2 at 112, 4294967298 ns: AA",
                                          "3 at 132, 7 ns: BB"));
    EXPECT_THAT(out.losses, IsEmpty());
    EXPECT_EQ(out.technology, "Ostrel_GSM");
}

TEST(PcapngReader, hasTheTechnologyBeforeTheFirstMessage) {
    auto reader = PcapngReader::open(
        ChunkedInput(std::make_unique<MemorySource>(PcapngFile().head().message(1, {}).data())));
    ASSERT_TRUE(reader);
    EXPECT_EQ((*reader)->technology(), "Ostrel_GSM");
}

TEST(PcapngReader, takesTheServicesConstantForTheShortName) {
    const ReadOut out =
        readOut(PcapngFile().section().messageInterface("kVoxLogChannelTechnology_Ostrel_LTE").data());
    EXPECT_EQ(out.technology, "Ostrel_LTE");
}

TEST(PcapngReader, leavesTheTechnologyOpenWhereNoInterfaceIsNamed) {
    const ReadOut out =
        readOut(PcapngFile().section().messageInterface("").message(1, hex("AA").bytes()).data());
    EXPECT_EQ(out.technology, "");
    EXPECT_THAT(out.messages, ElementsAre("1 at 60, 1 ns: AA"));
    EXPECT_THAT(out.losses, IsEmpty());
}

TEST(PcapngReader, takesTheFirstTechnologyAndReportsTheOthersAsLosses) {
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

TEST(PcapngReader, readsAllTechnologiesWhereThatIsAskedFor) {
    PcapngFile file;
    file.section().messageInterface("").messageInterface("Ostrel_LTE").messageInterface("Ostrel_GSM");
    for (std::uint32_t interface = 0; interface < 3; ++interface)
        file.message(interface, hex("AA").bytes(), interface);
    file.section().messageInterface("Ostrel_GSM").message(3, hex("BB").bytes());
    auto reader = PcapngReader::open(ChunkedInput(std::make_unique<MemorySource>(file.data())));
    ASSERT_TRUE(reader);
    (*reader)->setReadsAllTechnologies(true);
    std::vector<std::uint32_t> technologies;
    while (const auto message = (*reader)->next())
        technologies.push_back(message->technology);
    // An interface without a name belongs to the first that has one.
    EXPECT_THAT(technologies, ElementsAre(0, 0, 1, 1));
    EXPECT_THAT((*reader)->technologies(), ElementsAre("Ostrel_LTE", "Ostrel_GSM"));
    EXPECT_EQ((*reader)->technology(), "Ostrel_LTE");
    EXPECT_THAT((*reader)->losses(), IsEmpty());
}

TEST(PcapngReader, readsSixteenTechnologiesAtMost) {
    PcapngFile file;
    file.section();
    for (int i = 0; i < 17; ++i)
        file.messageInterface("T" + std::to_string(10 + i)); // 40 bytes each
    file.message(1, hex("AA").bytes(), 15).message(2, hex("BB").bytes(), 16);
    auto reader = PcapngReader::open(ChunkedInput(std::make_unique<MemorySource>(file.data())));
    ASSERT_TRUE(reader);
    (*reader)->setReadsAllTechnologies(true);
    const auto message = (*reader)->next();
    ASSERT_TRUE(message);
    EXPECT_EQ(message->technology, 15U);
    EXPECT_FALSE((*reader)->next());
    EXPECT_EQ((*reader)->technologies().size(), 16U);
    ASSERT_EQ((*reader)->losses().size(), 1U);
    EXPECT_EQ((*reader)->losses()[0].reason, "message of T26 in a recording of T10");
}

TEST(PcapngReader, passesOverInterfacesOfOtherLinkTypes) {
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

TEST(PcapngReader, losesInterfacesAboveTheirBound) {
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

TEST(PcapngReader, cutsSimplePacketsAtTheSnapshotLength) {
    PcapngFile file;
    file.section().interface(147, {}, 4);
    file.block(3, hex("04000000 01020304").bytes()).block(3, hex("06000000 01020304").bytes());
    const ReadOut out = readOut(file.data());
    EXPECT_THAT(out.messages, ElementsAre("1 at 48, 0 ns: 01020304"));
    EXPECT_THAT(out.losses, ElementsAre("at 68, 20 bytes, record 2: message cut short when it was captured: "
                                        "4 of 6 bytes"));
}

TEST(PcapngReader, countsMicrosecondsWhereTheResolutionIsNotGiven) {
    const ReadOut out = readOut(PcapngFile().section().interface(147).message(3, hex("AA").bytes()).data());
    EXPECT_THAT(out.messages, ElementsAre("1 at 48, 3000 ns: AA"));
}

TEST(PcapngReader, losesMessagesAbove16MiB) {
    PcapngFile file;
    file.head().message(1, std::vector<std::uint8_t>(16'777'217)).message(2, hex("AA").bytes());
    const ReadOut out = readOut(file.data());
    // 16777220 padded bytes in a block of 32 more
    EXPECT_THAT(out.losses, ElementsAre("at 76, 16777252 bytes, record 1: message of 16777217 bytes, "
                                        "wanted at most 16777216"));
    EXPECT_THAT(out.messages, ElementsAre("2 at 16777328, 2 ns: AA"));
}

TEST(PcapngReader, keepsTheFirstHundredLossesAndCountsAll) {
    PcapngFile file;
    file.head();
    for (std::uint64_t i = 0; i < 250; ++i)
        file.message(i, hex("AA").bytes(), 9);
    auto reader = PcapngReader::open(ChunkedInput(std::make_unique<MemorySource>(file.data())));
    ASSERT_TRUE(reader);
    EXPECT_FALSE((*reader)->next());
    ASSERT_EQ((*reader)->losses().size(), 100U);
    EXPECT_EQ((*reader)->losses().back().recordNumber, 100U);
    EXPECT_EQ((*reader)->lossTotals().losses, 250U);
    EXPECT_EQ((*reader)->lossTotals().bytes, 250U * 36U);
}

TEST(PcapngReader, opensNoFileThatIsNotThere) {
    const auto none = PcapngReader::open("none.pcapng");
    ASSERT_FALSE(none);
    EXPECT_EQ(none.reason(), "cannot open: No such file or directory");
}

TEST(PcapngReader, distinguishesAReadErrorFromTheEnd) {
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

TEST(PcapngReader, givesMessagesThatOutliveIt) {
    PcapngFile file;
    file.head();
    for (std::uint32_t i = 0; i < 5'000; ++i)
        file.message(i, file.number(i, 4).bytes());
    std::vector<Data> held;
    {
        auto reader = PcapngReader::open(ChunkedInput(std::make_unique<MemorySource>(file.data()), 8192));
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

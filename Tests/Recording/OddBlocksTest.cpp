// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Recording/PcapngFile.h"

#include <string>
#include <vector>

#include <gtest/gtest.h>

namespace velmora {
namespace {

/// A section header, and an interface "Ostrel_GSM" that counts nanoseconds: 76 bytes.
constexpr const char* littleEndianHead = R"(
    0A0D0D0A 1C000000 4D3C2B1A 0100 0000 FFFFFFFFFFFFFFFF 1C000000
    01000000 30000000 9300 0000 00000000
        0200 0A00 4F737472656C5F47534D 0000
        0900 0100 09 000000
        0000 0000
    30000000)";

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

} // namespace
} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/KnownValues.h"

#include "PropertyLists/Value.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

#include <zlib.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using testing::Pair;

std::set<KnownValues::Finding> foundIn(Bytes bytes,
                                       std::vector<std::string> values = {"8900101000000000017"}) {
    KnownValues known(values);
    known.search(bytes);
    return known.findings();
}

std::set<KnownValues::Finding> foundInHex(std::string_view text) {
    return foundIn(hex(text).bytes());
}

std::set<KnownValues::Finding> foundInText(std::string_view text) {
    return foundIn({reinterpret_cast<const std::uint8_t*>(text.data()), text.size()});
}

// 8900101000000000017 in each encoding, between other bytes. Encoded with Python's standard library.

TEST(KnownValuesTest, FindsText) {
    EXPECT_THAT(foundInText("x8900101000000000017y"), ElementsAre(Pair(0, ValueEncoding::Text)));
}

TEST(KnownValuesTest, FindsUTF16InBothByteOrders) {
    EXPECT_THAT(
        foundInHex("FF 3800 3900 3000 3000 3100 3000 3100 3000 3000 3000 3000 3000 3000 3000 3000 3000 "
                   "3000 3100 3700 FF"),
        ElementsAre(Pair(0, ValueEncoding::UTF16Little)));
    EXPECT_THAT(
        foundInHex("FF 0038 0039 0030 0030 0031 0030 0031 0030 0030 0030 0030 0030 0030 0030 0030 0030 "
                   "0030 0031 0037 FF"),
        ElementsAre(Pair(0, ValueEncoding::UTF16Big)));
}

TEST(KnownValuesTest, FindsBCDFromAnyHalfByteOn) {
    EXPECT_THAT(foundInHex("AA 89 00 10 10 00 00 00 00 01 7F"), ElementsAre(Pair(0, ValueEncoding::BCD)));
    EXPECT_THAT(foundInHex("AA A8 90 01 01 00 00 00 00 00 17"), ElementsAre(Pair(0, ValueEncoding::BCD)));
}

TEST(KnownValuesTest, FindsSwappedBCDFromAnyHalfByteOn) {
    EXPECT_THAT(foundInHex("AA 98 00 01 01 00 00 00 00 10 F7"),
                ElementsAre(Pair(0, ValueEncoding::SwappedBCD)));
    EXPECT_THAT(foundInHex("AA 8A 09 10 10 00 00 00 00 00 71"),
                ElementsAre(Pair(0, ValueEncoding::SwappedBCD)));
}

TEST(KnownValuesTest, FindsHexadecimal) {
    EXPECT_THAT(foundInText("(38393030313031303030303030303030303137)"),
                ElementsAre(Pair(0, ValueEncoding::Hexadecimal)));
    EXPECT_THAT(foundInText("(980001010000000010F7)"), ElementsAre(Pair(0, ValueEncoding::SwappedText)));
}

TEST(KnownValuesTest, FindsBase64AtEveryAlignment) {
    EXPECT_THAT(foundInText("ODkwMDEwMTAwMDAwMDAwMDAxNw=="), ElementsAre(Pair(0, ValueEncoding::Base64)));
    EXPECT_THAT(foundInText("eDg5MDAxMDEwMDAwMDAwMDAwMTc="), ElementsAre(Pair(0, ValueEncoding::Base64)));
    EXPECT_THAT(foundInText("eHg4OTAwMTAxMDAwMDAwMDAwMDE3"), ElementsAre(Pair(0, ValueEncoding::Base64)));
    EXPECT_THAT(foundInText("mAABAQAAAAAQ9w=="), ElementsAre(Pair(0, ValueEncoding::Base64))); // swapped BCD
}

TEST(KnownValuesTest, FindsWhatIsCompressed) {
    const std::string text = "some text, 8900101000000000017, and more of it";
    std::vector<std::uint8_t> packed(200, 0xAA);
    uLongf size = packed.size() - 10;
    ASSERT_EQ(compress(packed.data() + 10, &size, reinterpret_cast<const Bytef*>(text.data()), text.size()),
              Z_OK);
    EXPECT_THAT(foundIn(packed), ElementsAre(Pair(0, ValueEncoding::Text)));
}

TEST(KnownValuesTest, FindsWhatAPropertyListHolds) {
    const auto list = makeDictionary();
    list->set("a", Data::copyOf(hex("98 00 01 01 00 00 00 00 10 F7").bytes()));
    list->set("8900101000000000017", "key");
    KnownValues known({"8900101000000000017"});
    known.search(Value(list));
    EXPECT_THAT(known.findings(),
                ElementsAre(Pair(0, ValueEncoding::Text), Pair(0, ValueEncoding::SwappedBCD)));
}

TEST(KnownValuesTest, FindsPhoneNumbersHoweverTheyAreGrouped) {
    KnownValues known({"+1 555 0100"});
    known.search(Value("15550100"));
    EXPECT_THAT(known.findings(), ElementsAre(Pair(0, ValueEncoding::Text)));
}

TEST(KnownValuesTest, FindsNothingElse) {
    EXPECT_THAT(foundInText("8900101000000000018, 890010100000000001"), IsEmpty());
    EXPECT_THAT(foundIn(Bytes()), IsEmpty());
    EXPECT_THAT(foundInHex("78 9C 01 02 03"), IsEmpty());
}

TEST(KnownValuesTest, NamesTheValue) {
    const std::string_view text = "0123456789 and 9876543210";
    EXPECT_THAT(foundIn({reinterpret_cast<const std::uint8_t*>(text.data()), text.size()},
                        {"5555555555", "9876543210"}),
                ElementsAre(Pair(1, ValueEncoding::Text)));
}

} // namespace
} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Fields/DisplayWriter.h"

#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

constexpr EnumText colourRows[] = {{1, "one"}, {4, "four"}};
constexpr EnumTexts colours(colourRows, "Unknown");

constexpr EnumTexts numbered(colourRows, "[Reserved ", "]");
constexpr EnumTexts plain("<", ">");

constexpr Field fields[] = {
    {"Byte", u8At(0), integer("%d")},
    {"Signed Byte", i8At(0), integer("%d dBm")},
    {"Word", u16At(1), integer("%d")},
    {"Signed Word", i16At(1), integer("%d")},
    {"Big", u16BigEndianAt(1), integer("%d")},
    {"Long", u32At(3), integer("%d")},
    {"Unsigned Long", u32At(3), integer("%u")},
    {"Whole Long", u32At(3), real("%.0f")},
    {"Signed Long", i32At(3), real("%.0f dB")},
    {"Scaled", u8At(7), integer("%d dB", -140, 2)},
    {"Real", u8At(7), real("%4.2f dBm", 0.25, -140)},
    {"Bits", bitsAt(8, 1, 9), integer("%d")},
    {"Colour", u8At(7), text(colours)},
    {"Hole", u8At(10), text(colours)},
    {"Flag", u8At(7), flag("ON", "OFF")},
    {"Clear", u8At(10), flag("ON", "OFF")},
    {"Absent", u8At(7), unless(4, "Not Present", integer("%d dBm", -30))},
    {"Present", u8At(10), unless(4, "Not Present", integer("%d dBm", -30))},
    {"Numbered", u8At(7), text(numbered)},
    {"Reserved", u32At(3), text(numbered)},
    {"Plain", u8At(10), text(plain)},
    {"Hexadecimal", bitsAt(8, 0, 16), hexadecimal()},
};
constexpr Layout table = layout(11, fields);

TEST(FieldTableTest, NamesItsRowsInOrder) {
    const Data data = hex("F6          // byte: 246, signed -10\n"
                          "FE FF       // word: 65534, signed -2, big-endian 0xFEFF\n"
                          "00 00 00 80 // long: 2^31\n"
                          "04          // scaled: 4 x 2 - 140, real: 4 x 0.25 - 140\n"
                          "02 03       // bits: 0x302 >> 1 is 385\n"
                          "00");
    Dictionary node;
    DisplayWriter::SpareRows spare;
    DisplayWriter(node, spare).fields(Record(data), table);
    const Dictionary expected = {
        {"Byte", "246"},
        {"Signed Byte", "-10 dBm"},
        {"Word", "65534"},
        {"Signed Word", "-2"},
        {"Big", "65279"},
        {"Long", "-2147483648"},
        {"Unsigned Long", "2147483648"},
        {"Whole Long", "2147483648"},
        {"Signed Long", "-2147483648 dB"},
        {"Scaled", "-132 dB"},
        {"Real", "-139.00 dBm"},
        {"Bits", "385"},
        {"Colour", "four"},
        {"Hole", "Unknown"},
        {"Flag", "ON"},
        {"Clear", "OFF"},
        {"Absent", "Not Present"},
        {"Present", "-30 dBm"},
        {"Numbered", "four"},
        {"Reserved", "[Reserved -2147483648]"},
        {"Plain", "<0>"},
        {"Hexadecimal", "0x000302"},
    };
    ASSERT_EQ(node.size(), expected.size());
    for (auto shown = node.begin(), wanted = expected.begin(); shown != node.end(); ++shown, ++wanted) {
        EXPECT_EQ(shown->key, wanted->key);
        EXPECT_EQ(*shown->value.asString(), *wanted->value.asString()) << wanted->key;
    }
}

} // namespace
} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/Observations/ObservationFixture.h"

#include <limits>

namespace velmora {
namespace {

using Kind = ObservedKind;

constexpr EnumText stateRows[] = {{0, "Idle"}, {2, "Connected"}};
constexpr EnumTexts states(stateRows, "[State ", "]");

constexpr Field plain{"Plain", u8At(0), integer("%d")};
constexpr Field level{"Level", u8At(0), integer("%d dBm"), {.role = Role::ServingLevel, .scale = negated}};
constexpr Field bareLevel{"Bare", u8At(0), integer("%d"), {.unit = Unit::DBm, .scale = negated}};
constexpr Field stepped{"Stepped", u8At(0), integer("%d dBm", -140, 2)};
constexpr Field ratio{"Ratio", u16At(0), real("%4.2f dB", 0.25, -30)};
constexpr Field shifted{"Shifted", u8At(0), integer("%d"), {.unit = Unit::DBm, .scale = 0.5, .offset = -110}};
constexpr Field signedLow{"Signed", u16At(0), integer("%d"), {.sign = Sign::Signed}};
constexpr Field signedBits{"Bits", bitsAt(0, 0, 9), integer("%d"), {.sign = Sign::Signed}};
constexpr Field unsignedLow{"Unsigned", i16At(0), integer("%d"), {.sign = Sign::Unsigned}};
constexpr Field wideSigned{"Wide", u32At(0), integer("%d")};
constexpr Field wideUnsigned{"Wide", u32At(0), integer("%u")};
constexpr Field wideMeant{"Wide", u32At(0), integer("%d"), {.sign = Sign::Unsigned}};
constexpr Field identity{"Identity", u32At(0), hexadecimal()};
constexpr Field state{"State", u8At(0), text(states)};
constexpr Field ciphering{"Ciphering", u8At(0), flag("On", "Off")};
constexpr Field power{"Power", u8At(0), unless(64, "Not Present", integer("%d dBm", -30))};
constexpr Field rate{"Rate", computed, real("%.2f kbps")};
constexpr Field energy{"Energy", computed, real("%+.2f dB")};

struct NumberCase {
    const char* name;
    const Field* field;
    std::int64_t raw;
    Kind kind;
    double number;
    const char* text;
};

class ObservedNumberTest : public ObservationFixture, public testing::WithParamInterface<NumberCase> {};

TEST_P(ObservedNumberTest, IsTheValueThatIsMeantWithItsText) {
    const NumberCase& expected = GetParam();
    const Content contents[] = {*expected.field};
    begin(contents);
    observer.number(*expected.field, expected.raw);
    EXPECT_EQ(only().kind, expected.kind);
    EXPECT_EQ(only().raw, expected.raw);
    EXPECT_EQ(textOf(only()), expected.text);
    if (expected.kind == Kind::Number) {
        EXPECT_DOUBLE_EQ(only().number, expected.number);
    }
}

constexpr NumberCase numbers[] = {
    {"Plain", &plain, 17, Kind::Number, 17, "17"},
    {"NegatedLevel", &level, 71, Kind::Number, -71, "71 dBm"},
    {"NegatedLevelWithoutUnit", &bareLevel, 71, Kind::Number, -71, "71"},
    {"ScaleAndOffsetOfTheFormat", &stepped, 10, Kind::Number, -120, "-120 dBm"},
    {"RealOfSteps", &ratio, 21, Kind::Number, -24.75, "-24.75 dB"},
    {"ScaleAndOffsetOfTheMeaning", &shifted, 21, Kind::Number, -99.5, "21"},
    {"SignedAlthoughShownUnsigned", &signedLow, 65530, Kind::Number, -6, "65530"},
    {"SignedThatIsPositive", &signedLow, 32767, Kind::Number, 32767, "32767"},
    {"LeastSigned", &signedLow, 32768, Kind::Number, -32768, "32768"},
    {"SignedBits", &signedBits, 511, Kind::Number, -1, "511"},
    {"UnsignedAlthoughShownSigned", &unsignedLow, -25536, Kind::Number, 40000, "-25536"},
    {"ShownSigned", &wideSigned, 0xFFFFFFFF, Kind::Number, -1, "-1"},
    {"ShownUnsigned", &wideUnsigned, 0xFFFFFFFF, Kind::Number, 4294967295, "4294967295"},
    {"UnsignedOf32BitsAlthoughShownSigned", &wideMeant, 0xFFFFFFFF, Kind::Number, 4294967295, "-1"},
    {"Hexadecimal", &identity, 0xABC, Kind::Number, 2748, "0x000abc"},
    {"Enumeration", &state, 2, Kind::Enumeration, 0, "Connected"},
    {"EnumerationWithoutAText", &state, 7, Kind::Enumeration, 0, "[State 7]"},
    {"FlagSet", &ciphering, 3, Kind::Flag, 0, "On"},
    {"FlagClear", &ciphering, 0, Kind::Flag, 0, "Off"},
    {"Special", &power, 64, Kind::Absent, 0, "Not Present"},
    {"BesidesTheSpecial", &power, 63, Kind::Number, 33, "33 dBm"},
};
INSTANTIATE_TEST_SUITE_P(Fields, ObservedNumberTest, testing::ValuesIn(numbers),
                         [](const auto& tested) { return tested.param.name; });

class ObservedValueTest : public ObservationFixture {};

// 100 of the display's kilobits have 1024 bits each.
TEST_F(ObservedValueTest, ARateIsInThousandsOfBits) {
    const Content contents[] = {rate};
    begin(contents);
    observer.real(rate, 100);
    EXPECT_EQ(only().kind, Kind::Number);
    EXPECT_DOUBLE_EQ(only().number, 102.4);
    EXPECT_EQ(textOf(only()), "100.00 kbps");
    EXPECT_EQ(only().leaf->unit, Unit::KilobitPerSecond);
}

TEST_F(ObservedValueTest, WhatIsNotFiniteIsAbsent) {
    const Content contents[] = {energy};
    begin(contents);
    observer.real(energy, -std::numeric_limits<double>::infinity());
    observer.real(energy, std::numeric_limits<double>::quiet_NaN());
    observer.real(energy, -3.5);
    ASSERT_EQ(observations().size(), 3u);
    EXPECT_EQ(observations()[0].kind, Kind::Absent);
    EXPECT_EQ(textOf(observations()[0]), "-inf dB");
    EXPECT_EQ(observations()[1].kind, Kind::Absent);
    EXPECT_EQ(textOf(observations()[1]), "+nan dB");
    EXPECT_EQ(observations()[2].kind, Kind::Number);
    EXPECT_EQ(observations()[2].number, -3.5);
}

TEST_F(ObservedValueTest, ATextInPlaceOfANumberIsAbsent) {
    const Content contents[] = {level};
    begin(contents);
    observer.text(level, "N/A");
    EXPECT_EQ(only().kind, Kind::Absent);
    EXPECT_EQ(textOf(only()), "N/A");
}

TEST_F(ObservedValueTest, ATextIsItsWords) {
    static constexpr Field name{"Name", computed, plainText()};
    const Content contents[] = {name};
    begin(contents);
    {
        const std::string passing = "Test Net";
        observer.text(name, passing);
    }
    EXPECT_EQ(only().kind, Kind::Text);
    EXPECT_EQ(only().words, "Test Net");
    EXPECT_EQ(textOf(only()), "Test Net");
}

TEST_F(ObservedValueTest, WhatShowsWhyThereIsNoValueIsAbsent) {
    static constexpr Field why{"State", u8At(0), text(states), {.isAbsence = true}};
    const Content contents[] = {state, why};
    begin(contents);
    observer.number(why, 5);
    EXPECT_EQ(only().kind, Kind::Absent);
    EXPECT_EQ(textOf(only()), "[State 5]");
    EXPECT_EQ(only().leaf->kind, Kind::Enumeration);
}

// 3GPP TS 23.003 2.2: an MCC has three digits, an MNC two or three.
constexpr Field mnc{"MNC", computed, plainText(), {.digits = 2}};
constexpr Field numberMNC{"MNC", u16At(0), integer("%d"), {.digits = 2}};
constexpr Field numberMCC{"MCC", u16At(0), integer("%d"), {.digits = 3}};

struct CodeCase {
    const char* name;
    const Field* field;
    std::int64_t raw; ///< where there is no text
    const char* shown;
    bool isText;
    Kind kind;
    const char* words;
};

class ObservedCodeTest : public ObservationFixture, public testing::WithParamInterface<CodeCase> {};

TEST_P(ObservedCodeTest, KeepsItsDigits) {
    const CodeCase& expected = GetParam();
    const Content contents[] = {*expected.field};
    begin(contents);
    if (expected.isText)
        observer.text(*expected.field, expected.shown);
    else
        observer.number(*expected.field, expected.raw);
    EXPECT_EQ(only().leaf->kind, Kind::Text);
    EXPECT_EQ(only().kind, expected.kind);
    EXPECT_EQ(only().words, expected.words);
    EXPECT_EQ(textOf(only()), expected.shown);
}

constexpr CodeCase codes[] = {
    {"TwoDigitsAndABlank", &mnc, 0, "02 ", true, Kind::Text, "02"},
    {"ThreeDigits", &mnc, 0, "040", true, Kind::Text, "040"},
    {"OneDigit", &mnc, 0, "4  ", true, Kind::Absent, ""},
    {"BlankInTheMiddle", &mnc, 0, "0 4", true, Kind::Absent, ""},
    {"Blanks", &mnc, 0, "   ", true, Kind::Absent, ""},
    {"Letters", &mnc, 0, "0x4", true, Kind::Absent, ""},
    {"LostZero", &numberMNC, 4, "4", false, Kind::Text, "04"},
    {"Zero", &numberMNC, 0, "0", false, Kind::Text, "00"},
    {"NumberOfThreeDigits", &numberMNC, 123, "123", false, Kind::Text, "123"},
    {"TooLarge", &numberMNC, 1000, "1000", false, Kind::Absent, ""},
    {"Negative", &numberMNC, -1, "-1", false, Kind::Absent, ""},
    {"CountryCode", &numberMCC, 1, "1", false, Kind::Text, "001"},
};
INSTANTIATE_TEST_SUITE_P(Codes, ObservedCodeTest, testing::ValuesIn(codes),
                         [](const auto& tested) { return tested.param.name; });

} // namespace
} // namespace velmora

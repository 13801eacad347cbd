// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Observations/TextNumber.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

struct NumberCase {
    const char* text;
    double value;
    Unit unit;
};

class TextNumberTest : public testing::TestWithParam<NumberCase> {};

TEST_P(TextNumberTest, IsRead) {
    const std::optional<TextNumber> number = readTextNumber(GetParam().text);
    ASSERT_TRUE(number) << GetParam().text;
    EXPECT_EQ(number->value, GetParam().value) << GetParam().text;
    EXPECT_EQ(number->unit, GetParam().unit) << GetParam().text;
}

constexpr NumberCase numbers[] = {
    {"0", 0, Unit::None},
    {"62", 62, Unit::None},
    {"-71 dBm", -71, Unit::DBm},
    {"+3", 3, Unit::None},
    {"12.5", 12.5, Unit::None},
    {"0.25 dB", 0.25, Unit::DB},
    {"-0.5", -0.5, Unit::None},
    {"3 %", 3, Unit::Percent},
    {"59.2 kbit/s", 59.2, Unit::KilobitPerSecond},
    {"10 s", 10, Unit::Second},
    {"999999999999999", 999999999999999, Unit::None},
};
INSTANTIATE_TEST_SUITE_P(Numbers, TextNumberTest, testing::ValuesIn(numbers));

class NoTextNumberTest : public testing::TestWithParam<const char*> {};

TEST_P(NoTextNumberTest, IsNotRead) {
    EXPECT_FALSE(readTextNumber(GetParam())) << GetParam();
}

// Identities among them: leading zeros count, and so does every digit.
INSTANTIATE_TEST_SUITE_P(Texts, NoTextNumberTest,
                         testing::Values("", " ", "-", "+", "07", "00", "-07", "1234567890123456", "Cell 5",
                                         "5 MHz", "5  dB", "5 dB ", " 5", "5 ", "1e3", "0x10", "1.", ".5",
                                         "1.2.3", "--5", "+-5", "++5", "-+5", "1,5", "inf", "nan", "-inf dB",
                                         "5dB", "001-01", "1-2"));

} // namespace
} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Analysis/Rules/RuleFixture.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

struct Mistake {
    const char* what;
    std::string expression;
    std::size_t position; ///< in bytes
    std::string text;
};

void PrintTo(const Mistake& mistake, std::ostream* out) {
    *out << mistake.what;
}

class ExpressionErrorsTest : public testing::TestWithParam<Mistake> {};

TEST_P(ExpressionErrorsTest, NamesWhatWasFoundAndExpectedAndWhere) {
    const std::span<const Catalogue* const> all = ShippedCatalogues::instance().all();
    const auto parsed = parseExpression(GetParam().expression, InputNames({all.begin(), all.end()}));
    const auto* const mistake = std::get_if<ExpressionError>(&parsed);
    ASSERT_TRUE(mistake);
    EXPECT_EQ(mistake->text, GetParam().text);
    EXPECT_EQ(mistake->position, GetParam().position);
}

std::string times(std::size_t count, const std::string& text) {
    std::string all;
    for (std::size_t i = 0; i < count; ++i)
        all += text;
    return all;
}

const Mistake mistakes[] = {
    {"Empty", "", 0, "got the end, wanted a name, a number, a text or a path in quotes"},
    {"EndsEarly", "serving.level <", 15, "got the end, wanted a name, a number, a text or a path in quotes"},
    {"GoesOn", "serving.level < 3 4", 18, "got 4, wanted an operator or the end"},
    {"SingleEquals", "serving.level = 3", 14, "got =, wanted == for a comparison"},
    {"OpenParenthesis", "(serving.level < 3", 18, "got the end, wanted )"},
    {"OpenQuote", "radio.state == 'Idle", 15, "got a ' without another that ends the text"},
    {"ForeignCharacter", "serving.level \xC3\x97 2", 14,
     "got \xC3\x97, wanted a name, a number, a text or an operator"},
    {"UnknownRole", "serving.levle < -110", 0,
     "got the name serving.levle, wanted a role; the nearest are serving.level, serving.cell, serving.area"},
    {"MinusWithoutBlanks", "serving.level-neighbour.level > 3", 0,
     "got the name serving.level-neighbour.level, wanted a role; the nearest are neighbour.level, "
     "serving.level, serving.cell"},
    {"UnknownPath", "'/Serving Cell/Serving Cell Measurements/Measured RSRPs' < 3", 0,
     "got the path '/Serving Cell/Serving Cell Measurements/Measured RSRPs', wanted one of a display; the "
     "nearest "
     "are '/Serving Cell/Serving Cell Measurements/Measured RSRP', '/Serving Cell/Serving Cell "
     "Measurements/Measured RSRQ', '/Serving Cell/Serving Cell Measurements/Measured RSSI'"},
    {"UnknownUnit", "serving.level < -110 dbm", 21,
     "got the unit dbm, wanted dBm, dB, %, kbit/s, Mbit/s, ms, s, min, h, MHz, byte, m, km or deg"},
    {"UnitAtOnce", "serving.level < -110x", 20,
     "got the unit x, wanted dBm, dB, %, kbit/s, Mbit/s, ms, s, min, h, MHz, byte, m, km or deg"},
    {"UnitMismatch", "serving.level < -15 dB", 14,
     "got a number in dBm and a number in dB, wanted the same unit"},
    {"LevelAndQuality", "serving.level < serving.quality", 14,
     "got a number in dBm and a number in dB, wanted the same unit"},
    {"SumOfLevels", "serving.level + neighbour.level > 3", 14,
     "got a number in dBm and a number in dBm, wanted the same unit, or dBm and dB"},
    {"ProductOfUnits", "serving.level * serving.quality > 3", 14,
     "got a number in dBm and a number in dB, wanted at most one with a unit"},
    {"TextAndNumber", "radio.technology < 3", 17,
     "got a text and a plain number, wanted two numbers or two texts"},
    {"OrderOfTexts", "radio.technology < 'LTE'", 17, "got a text and a text, wanted == or != between texts"},
    {"NumberForCondition", "serving.level and true", 0, "got a number in dBm, wanted a condition"},
    {"ConditionForNumber", "(serving.level < 3) == true", 20,
     "got a condition and a condition, wanted numbers or texts: a condition needs no comparison"},
    {"TextInNumbers", "serving.channel in (1, 'a')", 23,
     "got a number without a unit and a text, wanted two numbers or two texts"},
    {"BackwardRange", "serving.level in -90..-100", 17, "got a range whose end is less than its start"},
    {"DeltaWithoutWindow", "delta(serving.level) > 3", 19, "got ), wanted ,"},
    {"WindowWithoutSeconds", "delta(serving.level, 3 dB) > 3", 21, "got 3 dB, wanted a time span as in 10 s"},
    {"WindowTooLong", "delta(serving.level, 2 h) > 3", 21, "got 2 h, wanted a time span from 1 ms to 1 h"},
    {"DeltaOfText", "delta(radio.technology, 3 s) > 3", 6, "got a text, wanted a number"},
    {"NothingToCount", "count(serving.level > 3) > 2", 0,
     "got no value that there is several times, wanted neighbour.level and the like, or a path with * for "
     "the rows "
     "of a list"},
    {"RowsOutside", "'/UMTS/Active Set/*/RSCP' > 3", 0,
     "'/UMTS/Active Set/*/RSCP' has a value in each row of a list, wanted it in count(), any(), all(), max() "
     "or "
     "min()"},
    {"TwoLists", "any('/UMTS/Active Set/*/RSCP' > neighbour.level)", 32,
     "got two lists, wanted the same in one count(), any(), all(), max() or min()"},
    {"EachInEach", "any(max(neighbour.level) > 3)", 4,
     "got two of count(), any(), all(), max() and min() in each other"},
    {"ChangedOfEach", "any(changed(neighbour.level))", 12,
     "got a value that there is several times, wanted one that there is once"},
    {"TooDeep", times(33, "(") + "true" + times(33, ")"), 33,
     "got more than 32 parentheses, calls and signs in each other"},
    {"TooManySigns", times(40, "-") + "1 < 2", 32,
     "got more than 32 parentheses, calls and signs in each other"},
    {"TooLong", times(300, "1 + ") + "1 < 2", 0, "got an expression of 1205 bytes, wanted at most 1024"},
    {"TooLargeNumber", "serving.level < " + times(400, "9"), 16, "got a number that is too large"},
};

std::string nameOfCase(const testing::TestParamInfo<Mistake>& info) {
    return info.param.what;
}

INSTANTIATE_TEST_SUITE_P(All, ExpressionErrorsTest, testing::ValuesIn(mistakes), nameOfCase);

TEST(ExpressionLimitsTest, CallsInEachOtherTakeLinearTime) {
    // Each count() is read once, however deep: otherwise this would take hours.
    const std::string text = times(30, "count(") + "serving.level > 3";
    const std::span<const Catalogue* const> all = ShippedCatalogues::instance().all();
    const auto parsed = parseExpression(text, InputNames({all.begin(), all.end()}));
    EXPECT_TRUE(std::holds_alternative<ExpressionError>(parsed));
}

} // namespace
} // namespace velmora

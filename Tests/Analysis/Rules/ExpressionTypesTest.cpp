// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Analysis/Rules/RuleFixture.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

struct Typed {
    std::string expression;
    std::string type;
};

class ExpressionTypesTest : public testing::TestWithParam<Typed> {};

TEST_P(ExpressionTypesTest, FollowFromCatalogueAndUnits) {
    const std::span<const Catalogue* const> all = ShippedCatalogues::instance().all();
    const auto parsed = parseExpression(GetParam().expression, InputNames({all.begin(), all.end()}));
    if (const auto* const mistake = std::get_if<ExpressionError>(&parsed))
        FAIL() << mistake->text;
    EXPECT_EQ(describe(std::get<Expression>(parsed).type()), GetParam().type) << GetParam().expression;
}

const Typed expressions[] = {
    {"serving.level", "a number in dBm"},
    {"serving.quality", "a number in dB"},
    {"block-error-rate", "a number in %"},
    {"data-rate", "a number in kbit/s"},
    {"serving.channel", "a number without a unit"},
    {"serving.mcc", "a text"},
    {"radio.state", "an enumeration"},
    {"radio.technology", "a text"},
    {"serving.physical-cell", "a number or a text"},
    {"serving.level - neighbour.level", "a number in dB"},
    {"serving.level - 3", "a number in dBm"},
    {"serving.level + 3 dB", "a number in dBm"},
    {"3 dB + serving.level", "a number in dBm"},
    {"2 * serving.quality", "a number in dB"},
    {"data-rate / 2", "a number in kbit/s"},
    {"data-rate / 1 Mbit/s", "a plain number"},
    {"-serving.level", "a number in dBm"},
    {"abs(serving.level - neighbour.level)", "a number in dB"},
    {"age(serving.level)", "a number in s"},
    {"delta(serving.level, 5s)", "a number in dB"},
    {"delta(data-rate, 5s)", "a number in kbit/s"},
    {"count(changed(serving.cell), 1 min)", "a number without a unit"},
    {"count(neighbour.level > -95)", "a number without a unit"},
    {"max(neighbour.level)", "a number in dBm"},
    {"min('/UMTS/Active Set/*/RSCP')", "a number in dBm"},
    {"known(serving.level)", "a condition"},
    {"neighbour.detected", "a condition"},
    {"'/UMTS/UMTS RR Info/Ciphering'", "a condition"},
    {"'/UMTS/UMTS RR Info/RRC State'", "an enumeration"},
    {"'/Serving Cell/Serving Cell Measurements/Srxlev'", "a number in dB"},
    {"'/Packet Data/PDP Context Info/0/APN'", "a text"},
    {"serving.level in (-100..-90, -80)", "a condition"},
    {"radio.state in ('Idle', \"Connected\")", "a condition"},
    {"not serving.level < -110 dBm or serving.quality <= -20 and true", "a condition"},
    {"serving.level < -110", "a condition"},
};

INSTANTIATE_TEST_SUITE_P(All, ExpressionTypesTest, testing::ValuesIn(expressions));

} // namespace
} // namespace velmora

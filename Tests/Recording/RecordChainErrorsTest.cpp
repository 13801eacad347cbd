// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/OpenMessages.h"
#include "Tests/Recording/ChainErrors.h"

#include <optional>
#include <stdexcept>
#include <string>
#include <vector>

#include <gtest/gtest.h>

// The error rates that Documentation/record-chain.md states for RecordChain's weights, held by the recordings
// of the tests. The bounds are about three times the rates there, since these are fewer damages.

namespace velmora {
namespace {

std::vector<Data> messagesOf(const std::string& technology) {
    const auto reader = openMessages(VELMORA_SOURCE_DIR "/Tests/Recordings/" + technology + ".pcapng");
    if (!reader)
        throw std::runtime_error(reader.reason());
    std::vector<Data> messages;
    while (const std::optional<LoggedMessage> message = (*reader)->next())
        messages.push_back(Data::copyOf(message->message.bytes()));
    return messages;
}

class RecordChainErrors : public testing::TestWithParam<const char*> {
protected:
    ChainErrors measure(ChainForm form, ChainDamage damage, std::size_t count, const RecordWeights& weights) {
        return measureChain(_messages, form, damage, count, weights, _random);
    }

    std::vector<Data> _messages = messagesOf(GetParam());
    std::mt19937_64 _random{1};
};

TEST_P(RecordChainErrors, areNoneWithoutDamage) {
    for (const ChainForm form : everyChainForm) {
        const ChainErrors errors = measure(form, ChainDamage::None, 50, {});
        EXPECT_EQ(errors.untouched, 50U * 40U);
        EXPECT_EQ(errors.errors(), 0U) << static_cast<int>(form);
    }
}

TEST_P(RecordChainErrors, areRareWithDamage) {
    constexpr std::size_t count = 50;
    for (const ChainForm form : everyChainForm) {
        for (const ChainDamage damage : everyChainDamage) {
            const ChainErrors errors = measure(form, damage, count, {});
            const std::size_t bound = form == ChainForm::RawMessages ? count / 25 : 2 * count / 5;
            EXPECT_LE(errors.errors(), bound) << static_cast<int>(form) << " " << static_cast<int>(damage);
        }
    }
}

/// The weights lie inside a margin: each of them may be two bits off.
TEST_P(RecordChainErrors, areRareWithAnyWeightTwoBitsOff) {
    constexpr int RecordWeights::*everyWeight[] = {
        &RecordWeights::type,           &RecordWeights::prefix,        &RecordWeights::wantedCode,
        &RecordWeights::versionReport,  &RecordWeights::nearTimestamp, &RecordWeights::zeroAmongZeros,
        &RecordWeights::zeroAmongTimes, &RecordWeights::farTimestamp,  &RecordWeights::badTimestamp,
        &RecordWeights::endOfInput,     &RecordWeights::goodFollower,  &RecordWeights::expected,
        &RecordWeights::sure,
    };
    constexpr std::size_t count = 10;
    for (const auto weight : everyWeight) {
        for (const int step : {-2, 2}) {
            RecordWeights weights;
            weights.*weight += step;
            ChainErrors errors;
            for (const ChainForm form : everyChainForm)
                for (const ChainDamage damage : everyChainDamage)
                    errors += measure(form, damage, count, weights);
            EXPECT_LE(4 * errors.errors(), errors.damages) << weights.*weight;
        }
    }
}

INSTANTIATE_TEST_SUITE_P(Recordings, RecordChainErrors, testing::Values("gsm", "lte", "utran", "c2k"),
                         [](const auto& each) { return std::string(each.param); });

TEST(RecordChainInNoise, findsNoRecord) {
    std::mt19937_64 random(1);
    for (const auto layout : {RecordChain::Layout::RawMessages, RecordChain::Layout::DLF})
        EXPECT_EQ(measureNoise(std::size_t{1} << 18, layout, {}, random).invented, 0U);
}

/// What makes the test above worth something: a threshold that is low enough finds records in noise.
TEST(RecordChainInNoise, findsRecordsWhereTheThresholdIsLow) {
    std::mt19937_64 random(1);
    RecordWeights weights;
    weights.sure = 4;
    EXPECT_GT(measureNoise(std::size_t{1} << 18, RecordChain::Layout::RawMessages, weights, random).invented,
              0U);
}

} // namespace
} // namespace velmora

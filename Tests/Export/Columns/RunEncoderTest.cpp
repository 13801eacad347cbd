// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/RunEncoder.h"

#include "Tests/Export/Columns/EncodedNumbers.h"

#include <gmock/gmock.h>
#include <rapidcheck/gtest.h>

#include <span>
#include <utility>
#include <vector>

namespace velmora {
namespace {

using testing::ElementsAre;

std::vector<std::uint8_t> encoded(unsigned width, const std::vector<std::uint32_t>& values) {
    RunEncoder encoder(width);
    for (const std::uint32_t value : values)
        encoder.put(value);
    return encoder.finish();
}

TEST(RunEncoder, packsEightNumbersWithoutGaps) {
    // The numbers 0 to 7 of three bits, the lowest bit first: 000 100 010 110 001 101 011 111.
    EXPECT_THAT(encoded(3, {0, 1, 2, 3, 4, 5, 6, 7}), ElementsAre(0x03, 0x88, 0xC6, 0xFA));
}

TEST(RunEncoder, fillsTheLastGroupWithZeros) {
    EXPECT_THAT(encoded(2, {1, 2, 3}), ElementsAre(0x03, 0x39, 0x00));
}

TEST(RunEncoder, writesEightOfOneNumberAsARun) {
    EXPECT_THAT(encoded(1, std::vector<std::uint32_t>(8, 1)), ElementsAre(0x10, 0x01));
}

TEST(RunEncoder, writesALongRunsLengthInSevenBitsAByte) {
    EXPECT_THAT(encoded(1, std::vector<std::uint32_t>(100, 0)), ElementsAre(0xC8, 0x01, 0x00));
}

TEST(RunEncoder, writesARunsNumberInWholeBytes) {
    EXPECT_THAT(encoded(9, std::vector<std::uint32_t>(8, 0x101)), ElementsAre(0x10, 0x01, 0x01));
}

TEST(RunEncoder, writesARunAfterAPackedGroup) {
    std::vector<std::uint32_t> values = {1, 0, 1, 0, 1, 0, 1, 0};
    values.insert(values.end(), 16, 1);
    EXPECT_THAT(encoded(1, values), ElementsAre(0x03, 0x55, 0x20, 0x01));
}

TEST(RunEncoder, endsAPackedRunAfter63Groups) {
    std::vector<std::uint32_t> values;
    for (std::uint32_t i = 0; i < 64 * 8; ++i)
        values.push_back(i % 2);
    const std::vector<std::uint8_t> bytes = encoded(1, values);
    ASSERT_EQ(bytes.size(), 1U + 63 + 1 + 1);
    EXPECT_EQ(bytes.front(), 0x7F);
    EXPECT_EQ(bytes[64], 0x03);
}

TEST(RunEncoder, writesNothingForNothing) {
    EXPECT_TRUE(encoded(1, {}).empty());
}

std::vector<std::uint32_t> decoded(const std::vector<std::uint8_t>& bytes, unsigned width,
                                   std::size_t count) {
    EncodedNumbers in(bytes);
    std::vector<std::uint32_t> values;
    while (in.left() > 0) {
        const std::uint64_t header = in.variable();
        if (header % 2 == 1) {
            for (const std::uint64_t value : in.packed(header / 2 * 8, width))
                values.push_back(static_cast<std::uint32_t>(value));
            continue;
        }
        std::uint32_t value = 0;
        for (unsigned bits = 0; bits < width; bits += 8)
            value |= static_cast<std::uint32_t>(in.byte()) << bits;
        values.insert(values.end(), header / 2, value);
    }
    RC_ASSERT(!in.isPastEnd());
    RC_ASSERT(values.size() >= count);
    RC_ASSERT(values.size() < count + 8);
    values.resize(count);
    return values;
}

RC_GTEST_PROP(RunEncoder, isReadBack, ()) {
    const auto width = *rc::gen::inRange(1U, 17U);
    const auto runs = *rc::gen::container<std::vector<std::pair<std::uint32_t, std::size_t>>>(
        rc::gen::pair(rc::gen::inRange(0U, 1U << width), rc::gen::inRange(std::size_t{0}, std::size_t{40})));
    std::vector<std::uint32_t> values;
    RunEncoder encoder(width);
    for (const auto& [value, count] : runs) {
        values.insert(values.end(), count, value);
        if (count % 2 == 0)
            encoder.put(value, count);
        else
            for (std::size_t i = 0; i < count; ++i)
                encoder.put(value);
    }
    RC_ASSERT(decoded(encoder.finish(), width, values.size()) == values);
}

RC_GTEST_PROP(RunEncoder, encodesManyAsOneByOne, ()) {
    const auto runs = *rc::gen::container<std::vector<std::pair<std::uint16_t, std::uint8_t>>>(
        rc::gen::pair(rc::gen::inRange<std::uint16_t>(0, 3), rc::gen::inRange<std::uint8_t>(1, 30)));
    std::vector<std::uint16_t> values;
    for (const auto& [value, count] : runs)
        values.insert(values.end(), count, value);
    const auto first = *rc::gen::inRange<std::size_t>(0, values.size() + 1);
    RunEncoder encoder(8);
    for (std::size_t i = 0; i < first; ++i)
        encoder.put(values[i]);
    encoder.put(std::span(std::as_const(values)).subspan(first));
    RC_ASSERT(encoder.finish() == encoded(8, {values.begin(), values.end()}));
}

} // namespace
} // namespace velmora

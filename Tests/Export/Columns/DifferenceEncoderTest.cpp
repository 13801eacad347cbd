// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/DifferenceEncoder.h"

#include "Tests/Export/Columns/EncodedNumbers.h"

#include <gmock/gmock.h>
#include <rapidcheck/gtest.h>

#include <limits>

namespace velmora {
namespace {

using testing::ElementsAre;

std::vector<std::uint8_t> encoded(const std::vector<std::int64_t>& values) {
    std::vector<std::uint8_t> bytes;
    appendDifferences(bytes, values);
    return bytes;
}

std::vector<std::uint8_t> filled(std::vector<std::uint8_t> begin, std::size_t zeros) {
    begin.insert(begin.end(), zeros, 0);
    return begin;
}

// Each begins with the block's 128 numbers, its 4 parts, the count of numbers, and the first of them.

TEST(DifferenceEncoder, writesNothingButTheHeaderForNothing) {
    EXPECT_THAT(encoded({}), ElementsAre(0x80, 0x01, 0x04, 0x00, 0x00));
}

TEST(DifferenceEncoder, writesOneNumberInTheHeader) {
    EXPECT_THAT(encoded({-3}), ElementsAre(0x80, 0x01, 0x04, 0x01, 0x05));
}

TEST(DifferenceEncoder, writesDifferencesInWholeBytes) {
    // The smallest is 0, the first part has 8 bits a difference, the others have none.
    EXPECT_EQ(encoded({1, 2, 3, 4, 5}),
              filled({0x80, 0x01, 0x04, 0x05, 0x02, 0x00, 8, 0, 0, 0, 1, 1, 1, 1}, 28));
}

TEST(DifferenceEncoder, countsFromTheSmallestWhereThatIsNegative) {
    // The differences are -2 three times and 1 four times.
    EXPECT_EQ(encoded({7, 5, 3, 1, 2, 3, 4, 5}),
              filled({0x80, 0x01, 0x04, 0x08, 0x0E, 0x03, 8, 0, 0, 0, 0, 0, 0, 3, 3, 3, 3}, 25));
}

TEST(DifferenceEncoder, wrapsAroundWhereADifferenceHasNoRoom) {
    // The largest less the smallest is -1 in 64 bits.
    EXPECT_THAT(encoded({std::numeric_limits<std::int64_t>::min(), std::numeric_limits<std::int64_t>::max()}),
                ElementsAre(0x80, 0x01, 0x04, 0x02, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF,
                            0x01, 0x01, 0, 0, 0, 0));
}

std::vector<std::int64_t> decoded(const std::vector<std::uint8_t>& bytes) {
    EncodedNumbers in(bytes);
    const std::uint64_t blockSize = in.variable();
    const std::uint64_t parts = in.variable();
    const std::uint64_t count = in.variable();
    auto last = static_cast<std::uint64_t>(in.zigzag());
    std::vector<std::int64_t> values;
    if (count > 0)
        values.push_back(static_cast<std::int64_t>(last));
    while (values.size() < count) {
        const auto least = static_cast<std::uint64_t>(in.zigzag());
        std::vector<unsigned> widths;
        for (std::uint64_t i = 0; i < parts; ++i)
            widths.push_back(in.byte());
        for (const unsigned width : widths) {
            if (values.size() == count)
                break;
            for (const std::uint64_t difference : in.packed(blockSize / parts, width))
                if (values.size() < count)
                    values.push_back(static_cast<std::int64_t>(last += least + difference));
        }
    }
    RC_ASSERT(!in.isPastEnd());
    RC_ASSERT(in.left() == 0U);
    return values;
}

RC_GTEST_PROP(DifferenceEncoder, isReadBack, ()) {
    const auto values =
        *rc::gen::oneOf(rc::gen::container<std::vector<std::int64_t>>(rc::gen::arbitrary<std::int64_t>()),
                        rc::gen::map(rc::gen::container<std::vector<std::int64_t>>(
                                         400, rc::gen::inRange<std::int64_t>(-3, 900)),
                                     [](std::vector<std::int64_t> steps) {
                                         for (std::size_t i = 1; i < steps.size(); ++i)
                                             steps[i] += steps[i - 1];
                                         return steps;
                                     }));
    RC_ASSERT(decoded(encoded(values)) == values);
}

} // namespace
} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/PageHeader.h"

#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

std::string text(const Data& data) {
    return {data.bytes().begin(), data.bytes().end()};
}

// In Thrift's compact protocol: a member begins with the difference of its number to the one before and its
// type, 5 for a number of 32 bits, C for a structure; numbers are zigzag; 0 ends a structure.

TEST(PageHeader, ofDataNamesSizesCountAndEncodings) {
    EXPECT_EQ(serialized(PageHeader{false, PageEncoding::DictionaryIndex, 3, 5, 10}),
              text(hex("15 00" // data
                       "15 14" // 10 bytes
                       "15 0A" // 5 of them compressed
                       "2C"
                       "15 06" // 3 values
                       "15 10" // indices of a dictionary
                       "15 06" // levels of definition as runs
                       "15 06" // and those of repetition
                       "00 00")));
}

TEST(PageHeader, ofADictionaryNamesItsCount) {
    EXPECT_EQ(serialized(PageHeader{true, PageEncoding::Plain, 70, 64, 560}),
              text(hex("15 04"
                       "15 E0 08" // 560 bytes
                       "15 80 01" // 64 of them compressed
                       "4C"
                       "15 8C 01" // 70 values
                       "15 00"
                       "00 00")));
}

} // namespace
} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Text/CountText.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

TEST(CountTextTest, PutsACommaAfterEachThousand) {
    EXPECT_EQ(countText(0), "0");
    EXPECT_EQ(countText(999), "999");
    EXPECT_EQ(countText(1'000), "1,000");
    EXPECT_EQ(countText(1'291), "1,291");
    EXPECT_EQ(countText(100'000), "100,000");
    EXPECT_EQ(countText(18'446'744'073'709'551'615U), "18,446,744,073,709,551,615");
}

} // namespace
} // namespace velmora

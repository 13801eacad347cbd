// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Log/QuietConsole.h"

#include "Platform/Console.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

TEST(QuietConsoleTest, DiscardsLinesDuringItsLifetime) {
    testing::internal::CaptureStderr();
    std::FILE* const earlier = redirectConsole(stderr);
    printLine("before");
    {
        const QuietConsole quiet;
        printLine("Deallocing ClassIndex");
    }
    printLine("after");
    redirectConsole(earlier);
    EXPECT_EQ(testing::internal::GetCapturedStderr(), "before\nafter\n");
}

} // namespace
} // namespace velmora

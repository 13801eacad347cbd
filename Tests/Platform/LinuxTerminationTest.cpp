// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Termination.h"

#include <gtest/gtest.h>

#include <exception>
#include <functional>
#include <new>
#include <stdexcept>
#include <string>

namespace velmora {
namespace {

struct EndRow {
    const char* name;
    std::function<void()> fail;
    const char* lastWords;
};

class LinuxTerminationTest : public testing::TestWithParam<EndRow> {};

TEST_P(LinuxTerminationTest, EndsTheProgramWithAWordAndAStatus) {
    testing::GTEST_FLAG(death_test_style) = "threadsafe";
    EXPECT_EXIT(
        {
            endOnUncaughtExceptions("tool");
            []() noexcept { GetParam().fail(); }();
        },
        testing::ExitedWithCode(1), GetParam().lastWords);
}

INSTANTIATE_TEST_SUITE_P(
    Failures, LinuxTerminationTest,
    testing::Values(EndRow{"Memory", [] { throw std::bad_alloc(); }, "^tool: out of memory\n$"},
                    EndRow{"Exception", [] { throw std::runtime_error("no pipe for a job"); },
                           "^tool: no pipe for a job\n$"},
                    EndRow{"AnythingElse", [] { throw 7; }, "^tool: unknown failure\n$"},
                    EndRow{"None", [] { std::terminate(); }, "^tool: unexpected end\n$"}),
    [](const auto& row) { return std::string(row.param.name); });

} // namespace
} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/ProcessRestart.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <string>
#include <vector>

#include <unistd.h>

namespace velmora {
namespace {

constexpr int notStarted = 3;

/// Ends the process in any case.
[[noreturn]] void restartWith(std::vector<std::string> arguments) {
    std::vector<char*> pointers;
    for (std::string& argument : arguments)
        pointers.push_back(argument.data());
    pointers.push_back(nullptr);
    std::fprintf(stderr, "%s\n", restartProcess(pointers.data()).reason.c_str());
    ::_exit(notStarted);
}

TEST(ProcessRestartTest, TheSameProgramRunsWithTheArguments) {
    const std::vector<std::string> arguments = {"any-name", "--gtest_list_tests"};
    EXPECT_EXIT(restartWith(arguments), testing::ExitedWithCode(0), "");
}

TEST(ProcessRestartTest, AFailureSaysWhy) {
    // No argument may be as long as that.
    const std::vector<std::string> arguments = {"any-name", std::string(std::size_t{1} << 20, 'x')};
    EXPECT_EXIT(restartWith(arguments), testing::ExitedWithCode(notStarted),
                "^any-name cannot be started anew: Argument list too long\n$");
}

} // namespace
} // namespace velmora

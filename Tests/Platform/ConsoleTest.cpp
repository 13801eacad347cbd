// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Console.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <gtest/gtest.h>

#include <fstream>
#include <iterator>

namespace velmora {
namespace {

TEST(Console, PrintsLinesToTheStreamThatIsSet) {
    const TemporaryDirectory directory;
    const std::string path = directory / "lines";
    std::FILE* file = std::fopen(path.c_str(), "w");
    ASSERT_TRUE(file);
    std::FILE* earlier = redirectConsole(file);
    printLine("one");
    printLine("");
    EXPECT_EQ(redirectConsole(earlier), file);
    std::fclose(file);
    std::ifstream written(path);
    EXPECT_EQ(std::string(std::istreambuf_iterator<char>(written), {}), "one\n\n");
}

} // namespace
} // namespace velmora

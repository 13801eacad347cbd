// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/ClassIndexTesting.h"

#include "LogGenerator/Base.h"
#include "Platform/Console.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdio>
#include <stdexcept>

namespace velmora {

std::vector<std::string> subscribers(const ClassIndex& index, std::uint32_t code) {
    std::vector<std::string> names;
    if (const std::vector<Base*>* sections = index.getSubscribers(code))
        for (const Base* section : *sections)
            names.emplace_back(section->getSectionName());
    return names;
}

void expectCodeCounts(const CapturedLog& log, std::initializer_list<int> counts) {
    std::vector<std::string> expected;
    for (const int count : counts)
        expected.push_back("Array Count: " + std::to_string(count));
    EXPECT_THAT(log.textsAt(LogPriority::Warning), ::testing::ElementsAreArray(expected));
    EXPECT_EQ(log.lines().size(), counts.size());
}

std::string printedBy(const std::function<void()>& run) {
    std::FILE* printed = std::tmpfile();
    if (!printed)
        throw std::runtime_error("no temporary file for what is printed");
    std::FILE* earlier = redirectConsole(printed);
    run();
    redirectConsole(earlier);
    std::rewind(printed);
    char text[200] = {};
    const std::size_t length = std::fread(text, 1, sizeof text, printed);
    std::fclose(printed);
    return std::string(text, length);
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/ClassIndexTesting.h"

#include "Platform/Console.h"

#include <cstdio>
#include <stdexcept>

namespace velmora {

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

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Console.h"

#include <utility>

namespace velmora {

namespace {

// Null means standard output, whose address is not a constant expression.
std::FILE* console = nullptr;

} // namespace

void printLine(std::string_view text) {
    std::FILE* stream = console ? console : stdout;
    std::fwrite(text.data(), 1, text.size(), stream);
    std::fputc('\n', stream);
}

std::FILE* redirectConsole(std::FILE* stream) {
    return std::exchange(console, stream);
}

} // namespace velmora

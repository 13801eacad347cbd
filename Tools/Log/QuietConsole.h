// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdio>

namespace velmora {

/// Discards the lines of the console (see Platform/Console.h) during its lifetime. Where /dev/null cannot be
/// opened they go where they went before.
class QuietConsole {
public:
    QuietConsole();
    ~QuietConsole();
    QuietConsole(const QuietConsole&) = delete;
    QuietConsole& operator=(const QuietConsole&) = delete;

private:
    std::FILE* _nowhere;
    std::FILE* _earlier = nullptr;
};

} // namespace velmora

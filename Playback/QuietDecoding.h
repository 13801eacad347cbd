// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/SystemLog.h"

#include <cstdio>

namespace velmora {

/// Leaves out what decoders write to the log and the console during its lifetime: the same messages are
/// decoded again with every seek.
class QuietDecoding {
public:
    QuietDecoding();
    ~QuietDecoding();
    QuietDecoding(const QuietDecoding&) = delete;
    QuietDecoding& operator=(const QuietDecoding&) = delete;

private:
    int _level;
    SystemLog* _log;
    std::FILE* _console;
};

} // namespace velmora

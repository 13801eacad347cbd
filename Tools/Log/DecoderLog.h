// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Log/DecoderLines.h"
#include "Tools/LogOverride.h"

namespace velmora {

/// While it lives, the process's log lines are a decoder's, and are counted.
class DecoderLog final : public LogOverride {
public:
    /// `lines` must outlive it.
    explicit DecoderLog(DecoderLines& lines) : _lines(lines) {}
    void write(int priority, std::string_view text) override {
        if (!_lines.take(priority, text))
            pass(priority, text);
    }

private:
    DecoderLines& _lines;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Decode/DecodeWriter.h"
#include "Tools/Text/TextBuffer.h"
#include "Tools/Text/TimeText.h"

#include <cstddef>
#include <string>

namespace velmora {

/// A writer of one line a refresh or message. Lines are collected and handed over in large pieces, and where
/// `isLive`, since somebody may wait for them, at each refresh as well. One that has been begun and not ended
/// is never handed over.
class LineWriter : public DecodeWriter {
public:
    void refreshed(Time tick, const Decoded& decoded) override;
    void flush() override;
    void finish(const Decoded&) override { flush(); }

protected:
    LineWriter(Output& output, bool isLive) : DecodeWriter(output), _isLive(isLive) {}

    /// Where the line at hand is appended.
    [[nodiscard]] TextBuffer& line() { return _lines; }
    void appendTime(Time moment) { _time.append(_lines, moment); }
    void endLine(std::string_view end);

private:
    bool _isLive;
    TextBuffer _lines;
    std::size_t _complete = 0; ///< how much of it is whole lines
    TimeText _time;
};

} // namespace velmora

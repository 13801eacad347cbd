// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Decode/DecodeWriter.h"
#include "Tools/Text/TextBuffer.h"
#include "Tools/Text/TimeText.h"

#include <cstddef>
#include <string>

namespace velmora {

/// A writer of one line per refresh or message. Lines are written in large blocks, and with `isLive`, since a
/// reader may be waiting for them, at each refresh as well. An incomplete line is never written.
class LineWriter : public DecodeWriter {
public:
    void didRefresh(Time tick, const Decoded& decoded) override;
    void flush() override;
    void finish(const Decoded&) override { flush(); }

protected:
    LineWriter(Output& output, bool isLive) : DecodeWriter(output), _isLive(isLive) {}

    /// The current line is appended here.
    [[nodiscard]] TextBuffer& line() { return _lines; }
    void appendTime(Time moment) { _time.append(_lines, moment); }
    void appendTime(TextBuffer& out, Time moment) { _time.append(out, moment); }
    void endLine(std::string_view end);
    /// The current line is not to be written.
    void dropLine() { _lines.truncate(_complete); }

private:
    bool _isLive;
    TextBuffer _lines;
    std::size_t _complete = 0; ///< how much of it is complete lines
    TimeText _time;
};

} // namespace velmora

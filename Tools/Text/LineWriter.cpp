// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Text/LineWriter.h"

#include "Tools/Output.h"

namespace velmora {

namespace {

constexpr std::size_t largeAllocation = std::size_t{256} << 10;

} // namespace

void LineWriter::endLine(std::string_view end) {
    _lines.append(end);
    _complete = _lines.size();
    if (_complete < largeAllocation)
        return;
    output().put(_lines.view());
    _lines.clear();
    _complete = 0;
}

void LineWriter::didRefresh(Time, const Decoded&) {
    if (_isLive)
        flush();
}

void LineWriter::flush() {
    _lines.truncate(_complete);
    output().put(_lines.view());
    output().flush();
    _lines.clear();
    _complete = 0;
}

} // namespace velmora

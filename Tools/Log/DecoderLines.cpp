// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Log/DecoderLines.h"

#include "Platform/SystemLog.h"
#include "Tools/Log/LineText.h"
#include "Tools/Text/CountText.h"

#include <utility>

namespace velmora {

bool DecoderLines::take(int priority, std::string_view text) {
    if (_verbose || _reporting)
        return false;
    if (isLifecycleLine(text))
        return true;
    text = text.substr(0, maximumLength);
    while (text.ends_with('\n'))
        text.remove_suffix(1);
    const LineText line = parseLine(text);
    _key = std::to_string(priority) + line.subject();
    appendWithoutNumbers(_key, line.what);
    if (const auto found = _indexes.find(_key); found != _indexes.end()) {
        Kind& kind = _kinds[found->second];
        ++kind.lines;
        kind.varies = kind.varies || kind.text != line.what;
    } else if (_kinds.size() == maximumKinds) {
        ++_otherLines;
    } else {
        _indexes.emplace(_key, _kinds.size());
        _kinds.push_back({priority, line.subject(), std::string(line.what), 1, false});
    }
    return true;
}

void DecoderLines::report(const std::string& title) {
    _reporting = true;
    const std::string begin = title.empty() ? title : title + ": ";
    for (const Kind& kind : std::exchange(_kinds, {}))
        logLine(kind.priority, begin + sum(kind));
    if (const std::uint64_t others = std::exchange(_otherLines, 0); others != 0)
        logLine(LogPriority::Error, begin + countText(others) + " more log lines; -v writes all of them");
    _indexes.clear();
    _reporting = false;
}

std::string DecoderLines::sum(const Kind& kind) {
    const char* const separator = kind.varies ? ", the first: " : ": ";
    if (!kind.subject.empty())
        return countText(kind.lines) + (kind.lines == 1 ? " message" : " messages") + kind.subject +
               separator + kind.text;
    return kind.lines == 1 ? kind.text : countText(kind.lines) + " times" + separator + kind.text;
}

} // namespace velmora

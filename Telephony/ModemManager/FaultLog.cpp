// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/FaultLog.h"

#include "Platform/SystemLog.h"

namespace velmora {

namespace {

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

/// Numbers of seven digits and more, which could be the subscriber's or the equipment's, become as many x:
/// ModemManager composes its errors from what modems answer.
std::string withoutLongNumbers(std::string text) {
    constexpr std::size_t longest = 6;
    for (std::size_t begin = 0; begin < text.size(); ++begin) {
        std::size_t end = begin;
        while (end < text.size() && isDigit(text[end]))
            ++end;
        if (end - begin > longest)
            text.replace(begin, end - begin, end - begin, 'x');
        begin = end;
    }
    return text;
}

} // namespace

void FaultLog::report(std::string_view subject, const std::string& text) {
    std::string& last = _reported[std::string(subject)];
    if (last == text)
        return;
    last = text;
    logFormat(LogPriority::Warning, "modemmanager: %s", withoutLongNumbers(text).c_str());
}

void FaultLog::clear(std::string_view subject) {
    if (const auto last = _reported.find(subject); last != _reported.end())
        _reported.erase(last);
}

} // namespace velmora

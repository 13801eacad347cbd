// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/SystemLog.h"

#include <cstdarg>
#include <cstdio>
#include <string>
#include <utility>

namespace velmora {

namespace {

SystemLog* currentLog = nullptr;

} // namespace

SystemLog* setSystemLog(SystemLog* log, int level) {
    detail::systemLogLevel = log ? level : -1;
    return std::exchange(currentLog, log);
}

void detail::writeToSystemLog(int priority, std::string_view text) {
    if (currentLog)
        currentLog->write(priority, text);
}

void logFormat(int priority, const char* format, ...) {
    if (!isLogged(priority))
        return;
    std::va_list arguments;
    va_start(arguments, format);
    std::va_list again;
    va_copy(again, arguments);
    // Nearly every line fits; one that does not is formatted again.
    char usual[256];
    const int length = std::vsnprintf(usual, sizeof usual, format, arguments);
    va_end(arguments);
    if (length >= 0 && static_cast<std::size_t>(length) < sizeof usual) {
        detail::writeToSystemLog(priority, {usual, static_cast<std::size_t>(length)});
    } else if (length >= 0) {
        std::string text(static_cast<std::size_t>(length), '\0');
        std::vsnprintf(text.data(), text.size() + 1, format, again);
        detail::writeToSystemLog(priority, text);
    }
    va_end(again);
}

} // namespace velmora

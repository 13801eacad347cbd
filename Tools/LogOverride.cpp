// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/LogOverride.h"

#include "Platform/Console.h"
#include "Platform/PrintableText.h"

#include <cstdlib>

namespace velmora {

LogOverride::LogOverride() : _level(detail::systemLogLevel), _earlier(setSystemLog(this, _level)) {}

LogOverride::~LogOverride() {
    setSystemLog(_earlier, _level);
}

void LogOverride::pass(int priority, std::string_view text) {
    if (_earlier)
        _earlier->write(priority, text);
}

DeferredLog::DeferredLog()
    : _console(::open_memstream(&_consoleText, &_consoleSize)),
      _earlierConsole(redirectConsole(_console ? _console : stderr)) {}

DeferredLog::~DeferredLog() {
    redirectConsole(_earlierConsole);
    release();
    if (_console)
        std::fclose(_console);
    std::free(_consoleText);
}

void DeferredLog::write(int priority, std::string_view text) {
    if (_released) {
        pass(priority, text);
        return;
    }
    if (_lines.size() == maximumLines) {
        _lines.pop_front();
        ++_leftOut;
    }
    _lines.emplace_back(priority, text);
}

void DeferredLog::release() {
    _released = true;
    if (_leftOut != 0)
        pass(LogPriority::Error, std::to_string(_leftOut) + " earlier lines left out");
    for (const auto& [priority, text] : _lines)
        pass(priority, text);
    _leftOut = 0;
    _lines.clear();
    if (_console) {
        std::fflush(_console);
        std::fwrite(_consoleText, 1, _consoleSize, _earlierConsole ? _earlierConsole : stdout);
        std::rewind(_console);
    }
}

void ProgressLine::show(std::string_view text) {
    clear();
    std::fputs(printable(text).c_str(), stderr);
    std::fflush(stderr);
    _shown = true;
}

void ProgressLine::clear() {
    if (_shown)
        std::fputs("\r\x1b[K", stderr);
    std::fflush(stderr);
    _shown = false;
}

void ProgressLine::write(int priority, std::string_view text) {
    clear();
    pass(priority, text);
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/FaultLog.h"

#include "Platform/SystemLog.h"

namespace velmora {

void FaultLog::report(std::string_view subject, const std::string& text) {
    std::string& last = _reported[std::string(subject)];
    if (last == text)
        return;
    last = text;
    logFormat(LogPriority::Warning, "modemmanager: %s", text.c_str());
}

void FaultLog::clear(std::string_view subject) {
    if (const auto last = _reported.find(subject); last != _reported.end())
        _reported.erase(last);
}

} // namespace velmora

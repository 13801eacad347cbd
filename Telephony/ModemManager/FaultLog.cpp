// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/FaultLog.h"

#include "Platform/SystemLog.h"

namespace velmora {

void FaultLog::report(std::string_view subject, const std::string& text) {
    std::string& told = _reported[std::string(subject)];
    if (told == text)
        return;
    told = text;
    logFormat(LogPriority::Warning, "modemmanager: %s", text.c_str());
}

void FaultLog::clear(std::string_view subject) {
    if (const auto told = _reported.find(subject); told != _reported.end())
        _reported.erase(told);
}

} // namespace velmora

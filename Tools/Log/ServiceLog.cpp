// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Log/ServiceLog.h"

#include "Tools/Log/ConnectionLine.h"
#include "Tools/Log/LineText.h"

namespace velmora {

void ServiceLog::write(int priority, std::string_view text) {
    const ConnectionLine line = parseConnectionLine(text);
    // The first line of an attempt has the cause, the later ones what follows from it.
    if (!line.problem.empty() && _attemptFailed)
        setProblem(line.problem);
    if (line.kind != ConnectionLine::Kind::Other)
        _attemptFailed = line.kind == ConnectionLine::Kind::LastOfAttempt;
    const bool isCounted =
        (line.kind != ConnectionLine::Kind::Other || isLifecycleLine(text)) && _lines.take(priority, text);
    if (!isCounted)
        pass(priority, text);
}

void ServiceLog::setProblem(const std::string& problem) {
    if (problem == _problem)
        return;
    _problem = problem;
    if (_changed)
        _changed(_problem);
}

} // namespace velmora

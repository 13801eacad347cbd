// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/StderrLog.h"

#include "Platform/PrintableText.h"

#include <unistd.h>

#include <cerrno>

namespace velmora {

StderrLog::StderrLog() : _descriptor(STDERR_FILENO) {}

void StderrLog::write(int priority, std::string_view text) {
    _line = {'<', static_cast<char>('0' + (priority & 7)), '>'};
    _line += printableLine(text); // which may say what another program or a file says
    _line += '\n';

    std::string_view rest = _line;
    while (!rest.empty()) {
        const auto written = ::write(_descriptor, rest.data(), rest.size());
        if (written >= 0)
            rest.remove_prefix(static_cast<std::size_t>(written));
        else if (errno != EINTR)
            return; // there is nowhere left to say so
    }
}

} // namespace velmora

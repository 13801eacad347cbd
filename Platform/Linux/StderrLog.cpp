// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/StderrLog.h"

#include <unistd.h>

#include <algorithm>
#include <cerrno>

namespace velmora {

StderrLog::StderrLog() : _descriptor(STDERR_FILENO) {}

void StderrLog::write(int priority, std::string_view text) {
    if (text.ends_with('\n'))
        text.remove_suffix(1);
    _line = {'<', static_cast<char>('0' + (priority & 7)), '>'};
    _line += text;
    std::replace(_line.begin(), _line.end(), '\n', ' ');
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

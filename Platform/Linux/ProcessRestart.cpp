// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/ProcessRestart.h"

#include "Platform/Linux/Errno.h"

#include <unistd.h>

#include <cerrno>
#include <string>

namespace velmora {

Failure restartProcess(char** arguments) {
    // The running program's own file, whatever name it was started by and whatever has that name now.
    ::execv("/proc/self/exe", arguments);
    return Failure{std::string(arguments[0]) + " cannot be started anew: " + errnoText(errno)};
}

} // namespace velmora

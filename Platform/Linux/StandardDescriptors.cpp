// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/StandardDescriptors.h"

#include <fcntl.h>
#include <unistd.h>

#include <cerrno>

namespace velmora {

void openClosedStandardDescriptors() {
    for (int wanted = STDIN_FILENO; wanted <= STDERR_FILENO; ++wanted) {
        if (::fcntl(wanted, F_GETFD) >= 0 || errno != EBADF)
            continue;
        // The lowest free number is the one that is missing, since those below it are open by now.
        const int opened = ::open("/dev/null", O_RDWR);
        if (opened < 0)
            return; // without /dev/null there is nothing to open instead
    }
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/OutputGuard.h"

#include "Tools/Report.h"

#include <algorithm>
#include <climits>
#include <csignal>

#include <sys/stat.h>
#include <unistd.h>

namespace velmora {

namespace {

/// The name of the file that a signal which ends the program has to remove; a signal handler needs it global.
char nameToRemove[PATH_MAX];

void removeAndExit(int number) {
    ::unlink(nameToRemove);
    ::signal(number, SIG_DFL);
    ::raise(number);
}

void handle(void (*handler)(int)) {
    for (const int number : {SIGHUP, SIGINT, SIGTERM})
        // A signal that was ignored when the program started stays ignored.
        if (::signal(number, handler) == SIG_IGN)
            ::signal(number, SIG_IGN);
}

bool isSameFile(const struct stat& a, const struct stat& b) {
    return a.st_dev == b.st_dev && a.st_ino == b.st_ino;
}

} // namespace

std::string whyNotWritten(const std::string& in, const std::string& out, bool overwrites) {
    struct stat outStatus = {};
    if (::stat(out.c_str(), &outStatus) != 0)
        return {};
    struct stat inStatus = {};
    const bool hasInput = (in == "-" ? ::fstat(STDIN_FILENO, &inStatus) : ::stat(in.c_str(), &inStatus)) == 0;
    if (hasInput && isSameFile(inStatus, outStatus))
        return out + " is the input, wanted another file";
    if (!S_ISREG(outStatus.st_mode))
        return out + " is no regular file";
    return overwrites ? std::string() : fileExistsMessage(out);
}

RemovedWhenInterrupted::RemovedWhenInterrupted(std::string_view name) {
    if (name.size() >= sizeof nameToRemove)
        return;
    *std::copy(name.begin(), name.end(), nameToRemove) = '\0';
    handle(removeAndExit);
}

RemovedWhenInterrupted::~RemovedWhenInterrupted() {
    handle(SIG_DFL);
}

} // namespace velmora

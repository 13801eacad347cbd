// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Termination.h"

#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <exception>
#include <new>

#include <unistd.h>

namespace velmora {

namespace {

constexpr int failed = 1;

const char* programName = "";

[[noreturn]] void endProgram() noexcept {
    char text[1024];
    std::snprintf(text, sizeof text, "%s: %s\n", programName, terminationReason());
    writeToStandardError(text);
    // No destructor runs: the program's objects are as the failure left them.
    std::_Exit(failed);
}

} // namespace

const char* terminationReason() noexcept {
    // The text belongs to the exception, which so lives as long as the program.
    static std::exception_ptr exception;
    exception = std::current_exception();
    if (!exception)
        return "unexpected end";
    try {
        std::rethrow_exception(exception);
    } catch (const std::bad_alloc&) {
        return "out of memory";
    } catch (const std::exception& error) {
        return error.what();
    } catch (...) {
        return "unknown failure";
    }
}

void writeToStandardError(std::string_view text) noexcept {
    while (!text.empty()) {
        const auto written = ::write(STDERR_FILENO, text.data(), text.size());
        if (written >= 0)
            text.remove_prefix(static_cast<std::size_t>(written));
        else if (errno != EINTR)
            return; // there is nowhere left to say so
    }
}

void endOnUncaughtExceptions(const char* program) {
    programName = program;
    std::set_terminate(endProgram);
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Report.h"

#include "Recorder/OverwriteTarget.h"

#include "Platform/Linux/Termination.h"
#include "Platform/PrintableText.h"
#include "Tools/ExitStatus.h"

#include <cinttypes>
#include <cstdio>
#include <cstdlib>
#include <exception>
#include <utility>

namespace velmora {

namespace {

// The terminate handler has no other way to find it.
WorkContext* currentContext = nullptr;
char lastWords[4096];

/// No destructor runs: the program's objects are as the failure left them.
[[noreturn]] void endSaying(const char* text) {
    writeToStandardError(text);
    std::_Exit(ExitStatus::BadInput);
}

} // namespace

void report(std::string_view text) {
    std::string line = "velmora-log: ";
    line += printableLine(text);
    line += '\n';
    writeToStandardError(line);
}

std::string fileTitle(const std::string& path) {
    return path == "-" ? "standard input" : path;
}

std::string fileExistsMessage(const std::string& path) {
    return existingFileMessage(path);
}

std::string positionInFile(std::string_view title, std::uint64_t number, std::uint64_t offset) {
    std::string place(title);
    if (number != 0)
        place += ": record " + std::to_string(number) + " at offset " + std::to_string(offset);
    return place;
}

WorkContext::WorkContext(const std::string& title, std::function<void()> cleanUp)
    : _title(printable(title)), _cleanUp(std::move(cleanUp)), _earlier(std::exchange(currentContext, this)) {}

WorkContext::~WorkContext() {
    currentContext = _earlier;
}

void WorkContext::installTerminateHandler() {
    std::set_terminate(&WorkContext::terminate);
}

void WorkContext::terminate() noexcept {
    // Allocates nothing, since memory may be exhausted.
    const char* const reason = terminationReason();
    const WorkContext* const context = currentContext;
    if (!context || context->_title.empty())
        std::snprintf(lastWords, sizeof lastWords, "velmora-log: %s\n", reason);
    else if (context->_number == 0)
        std::snprintf(lastWords, sizeof lastWords, "velmora-log: %s: %s\n", context->_title.c_str(), reason);
    else
        std::snprintf(lastWords, sizeof lastWords,
                      "velmora-log: %s: record %" PRIu64 " at offset %" PRIu64 ": %s\n",
                      context->_title.c_str(), context->_number, context->_offset, reason);
    // A failure while cleaning up must not come back here.
    std::set_terminate([] { endSaying(lastWords); });
    for (const WorkContext* each = context; each; each = each->_earlier)
        if (each->_cleanUp)
            each->_cleanUp();
    endSaying(lastWords);
}

} // namespace velmora

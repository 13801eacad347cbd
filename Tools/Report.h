// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <functional>
#include <string>
#include <string_view>

namespace velmora {

/// Writes a message to standard error: "velmora-log: " and the text, in one write.
void report(std::string_view text);

/// A file's name in messages: "standard input" for "-".
[[nodiscard]] std::string fileTitle(const std::string& path);

/// The message of a command that refuses to overwrite a file.
[[nodiscard]] std::string fileExistsMessage(const std::string& path);

/// "TITLE: record N at offset O", or the title alone where there is no record (number 0).
[[nodiscard]] std::string positionInFile(std::string_view title, std::uint64_t number, std::uint64_t offset);

/// What the program is working on, for the message that it ends with when a decoder ends it: some failures of
/// the decoders are meant to end the program and are caught nowhere. The latest one counts. Main thread only.
class WorkContext {
public:
    /// `title`: a file, or the service, or empty. `cleanUp` runs before the program ends that way, and before
    /// those of the contexts around this one.
    explicit WorkContext(const std::string& title, std::function<void()> cleanUp = {});
    ~WorkContext();
    WorkContext(const WorkContext&) = delete;
    WorkContext& operator=(const WorkContext&) = delete;

    /// The record that is about to be decoded; numbers count from 1.
    void atRecord(std::uint64_t number, std::uint64_t offset) {
        _number = number;
        _offset = offset;
    }

    /// From now on an uncaught exception ends the program with "velmora-log: PLACE: REASON" on
    /// standard error and exit status 1.
    static void installTerminateHandler();

private:
    [[noreturn]] static void terminate() noexcept;

    std::string _title;
    std::function<void()> _cleanUp;
    std::uint64_t _number = 0;
    std::uint64_t _offset = 0;
    WorkContext* _earlier;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Files/FileDescriptor.h"
#include "Platform/Linux/MainLoop.h"
#include "Platform/Linux/Ports/SocketWatch.h"

#include <cstdint>
#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include <sys/types.h>

namespace velmora {

/// The test program's one event loop, made in its `main`.
[[nodiscard]] MainLoop& testLoop();

/// Serves events until the condition holds; false after 40 seconds, which no working test comes near.
[[nodiscard]] bool eventually(const std::function<bool()>& condition);

/// A program that the test runs and whose output it collects on its event loop, so that the test can serve it
/// at the same time. Killed in the end.
class ToolProcess {
public:
    struct Setup {
        std::vector<std::string> arguments;
        std::optional<std::string> input;               ///< standard input; empty where there is none
        std::map<std::string, std::string> environment; ///< beside the test's own
        bool onTerminal = false;       ///< standard input and output are a terminal of 60 columns and 12 rows
        bool errorsOnTerminal = false; ///< standard error is that terminal as well, or one of its own
        std::optional<std::string> outputFile; ///< standard output goes there
    };

    /// Runs the built velmora-log, or another program.
    explicit ToolProcess(const Setup& setup, std::string program = {});
    ~ToolProcess();
    ToolProcess(const ToolProcess&) = delete;
    ToolProcess& operator=(const ToolProcess&) = delete;

    /// What has been written so far; on a terminal all of standard output's bytes as it got them.
    [[nodiscard]] const std::string& output() const { return _output.text; }
    [[nodiscard]] const std::string& errors() const { return _errors.text; }
    /// Waits until the text has been written, from `from` on. Where it ends in the output; nothing when it
    /// never comes.
    [[nodiscard]] std::optional<std::size_t> waitFor(const std::string& text, std::size_t from = 0);
    /// Waits for the end. The exit status, 128 and the number for a signal; nothing when it never comes.
    [[nodiscard]] std::optional<int> exitStatus();

    /// As `waitFor`, on standard error.
    [[nodiscard]] bool waitForError(const std::string& text);

    void signal(int number) const;
    /// From now on its files may not grow beyond this; absent: as far as the test's own.
    void limitFileSize(std::optional<std::uint64_t> bytes) const;
    /// Types on the terminal.
    void type(const std::string& keys) const;
    void resize(unsigned short columns, unsigned short rows) const;
    /// Closes the end of the pipe that standard output is read from.
    void stopReading();
    [[nodiscard]] pid_t id() const { return _id; }
    [[nodiscard]] int terminal() const { return _output.end.get(); }

private:
    struct Stream {
        FileDescriptor end;
        std::string text;
        std::unique_ptr<SocketWatch> watch;
        bool ended = false;

        void start();
        void read();
    };

    pid_t _id = -1;
    std::optional<int> _status;
    Stream _output;
    Stream _errors;
};

/// The lines of a program's standard error that are its own words, not the log's nor the console's.
[[nodiscard]] std::string ownMessages(const std::string& errors);

} // namespace velmora

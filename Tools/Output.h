// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>

namespace velmora {

/// Where a command's result goes: standard output, in few large writes. Expects SIGPIPE to be ignored. After
/// the reader has closed the pipe, or a write has failed, further text is dropped. Main thread only.
class Output {
public:
    enum class State {
        Open,
        Closed, ///< the reader has closed the pipe, which is no error
        Failed, ///< a write failed; the error has been reported
    };

    /// Writes to a descriptor that the caller owns; `name` is what a message calls it.
    explicit Output(int descriptor, std::string name = "standard output");
    /// Writes out what is left.
    ~Output();
    Output(const Output&) = delete;
    Output& operator=(const Output&) = delete;

    void put(std::string_view text);
    /// Writes out everything so far.
    void flush();

    [[nodiscard]] State state() const { return _state; }
    [[nodiscard]] bool isOpen() const { return _state == State::Open; }
    /// Whether the reader has closed the pipe; polls, and writes nothing.
    [[nodiscard]] bool hasClosedReader() const;

private:
    void write(std::string_view rest);

    int _descriptor;
    std::string _name;
    std::string _buffer;
    State _state = State::Open;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>

namespace velmora {

/// Where a command's result goes: standard output, in few large writes. Expects SIGPIPE to be ignored. Once
/// the reader has gone, or writing has failed, what is put here goes nowhere. Main thread only.
class Output {
public:
    enum class State {
        Open,
        Closed, ///< nobody reads any more, which is no error
        Failed, ///< the system refused a write; the user has been told
    };

    /// Writes to a descriptor that stays the caller's; `name` is what a message calls it.
    explicit Output(int descriptor, std::string name = "standard output");
    /// Writes out what is left.
    ~Output();
    Output(const Output&) = delete;
    Output& operator=(const Output&) = delete;

    void put(std::string_view text);
    /// Hands everything so far to the system.
    void flush();

    [[nodiscard]] State state() const { return _state; }
    [[nodiscard]] bool isOpen() const { return _state == State::Open; }
    /// Whether the reader has gone, asked of the system without writing.
    [[nodiscard]] bool hasLostReader() const;

private:
    void write(std::string_view rest);

    int _descriptor;
    std::string _name;
    std::string _buffer;
    State _state = State::Open;
};

} // namespace velmora

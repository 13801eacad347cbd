// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/OutputDetour.h"

#include <cstdint>
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
    /// Writes out everything so far and then `size` bytes of a file from `offset` on, which the system copies
    /// without a buffer here where it can. False where the file cannot be read; not for a failed write.
    [[nodiscard]] bool putFile(int file, std::uint64_t offset, std::uint64_t size);

    /// From now on whatever is about to be written is offered to the detour, which must outlive this.
    void setDetour(OutputDetour* detour) { _detour = detour; }
    /// Whether no other process writes to it first.
    [[nodiscard]] bool isFirst() const { return !_detour || _detour->isFirst(); }
    [[nodiscard]] State state() const { return _state; }
    [[nodiscard]] bool isOpen() const { return _state == State::Open; }
    /// Whether the reader has closed the pipe; polls, and writes nothing.
    [[nodiscard]] bool hasClosedReader() const;

private:
    void write(std::string_view rest);
    /// After a write or a copy has failed with that error; the state follows from it.
    void handle(int error);

    int _descriptor;
    std::string _name;
    std::string _buffer;
    State _state = State::Open;
    OutputDetour* _detour = nullptr;
};

} // namespace velmora

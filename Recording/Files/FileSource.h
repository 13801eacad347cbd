// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/Files/ByteSource.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <string>

namespace velmora {

/// The bytes of an open file, pipe or terminal. Owns the descriptor by default. Main thread only.
class FileSource final : public ByteSource {
public:
    /// What is called while the file is read. Each may be null.
    struct Hooks {
        /// Nothing is there to be read, as on a pipe whose writer has paused.
        std::function<void()> beforeWaiting = {};
        /// At least every 50 ms while nothing is there; false ends the input with a failure.
        std::function<bool()> whileWaiting = {};
        /// Before each read, with the bytes so far; false ends the input with a failure. A damaged file may
        /// be read for long without a message.
        std::function<bool(std::uint64_t offset)> mayRead = {};
    };

    /// Opens the file; "-" is standard input, which stays open afterwards. The reason does not repeat the
    /// path.
    static Result<std::unique_ptr<ByteSource>> open(const std::string& path, Hooks hooks);
    static Result<std::unique_ptr<ByteSource>> open(const std::string& path) { return open(path, Hooks()); }

    /// Reads an open descriptor, and closes it on destruction when `owned`.
    FileSource(int descriptor, bool owned, Hooks hooks);
    FileSource(int descriptor, bool owned) : FileSource(descriptor, owned, Hooks()) {}
    ~FileSource() override;
    FileSource(const FileSource&) = delete;
    FileSource& operator=(const FileSource&) = delete;

    Result<std::size_t> read(std::span<std::uint8_t> buffer) override;

private:
    /// Until there is something to read. False where the input is to end.
    [[nodiscard]] bool wait() const;

    int _descriptor;
    bool _owned;
    Hooks _hooks;
    std::uint64_t _offset = 0; ///< bytes read
};

} // namespace velmora

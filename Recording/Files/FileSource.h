// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/Files/ByteSource.h"

#include <functional>
#include <memory>
#include <string>

namespace velmora {

/// The bytes of an open file, pipe or terminal. Owns the descriptor by default. Main thread only.
class FileSource final : public ByteSource {
public:
    /// Opens the file; "-" is standard input, which stays open afterwards. `beforeWaiting` is called when
    /// nothing is there to be read, as on a pipe whose writer has paused; it may be null. The reason does not
    /// repeat the path.
    static Result<std::unique_ptr<ByteSource>> open(const std::string& path,
                                                    std::function<void()> beforeWaiting = {});

    /// Reads an open descriptor, and closes it on destruction when `owned`.
    FileSource(int descriptor, bool owned, std::function<void()> beforeWaiting = {});
    ~FileSource() override;
    FileSource(const FileSource&) = delete;
    FileSource& operator=(const FileSource&) = delete;

    Result<std::size_t> read(std::span<std::uint8_t> buffer) override;

private:
    int _descriptor;
    bool _owned;
    std::function<void()> _beforeWaiting;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"
#include "Recording/Files/ChunkedInput.h"
#include "Recording/Files/SharedFile.h"
#include "Recording/MessageReader.h"

#include <cstdint>
#include <memory>
#include <vector>

namespace velmora {

/// Messages in a nameless temporary file, to be read again from any of them: for files whose form can only be
/// read from the front, and those that are compressed. Main thread only.
class MessageSpool {
public:
    static Result<std::unique_ptr<MessageSpool>> create();

    [[nodiscard]] Result<Done> append(const LoggedMessage& message);
    /// Where the next message that is appended begins.
    [[nodiscard]] std::uint64_t end() const { return _written + _buffer.size(); }
    /// The messages from one that begins there, with those that are appended while they are read. The reader
    /// may not outlive this.
    [[nodiscard]] Result<std::unique_ptr<MessageReader>> from(std::uint64_t begin);

private:
    explicit MessageSpool(std::shared_ptr<SharedFile> file) : _file(std::move(file)) {}
    [[nodiscard]] Result<Done> flush();
    [[nodiscard]] Result<ChunkedInput> inputFrom(std::uint64_t offset);

    std::shared_ptr<SharedFile> _file;
    std::uint64_t _written = 0;
    std::vector<std::uint8_t> _buffer; ///< what follows
};

} // namespace velmora

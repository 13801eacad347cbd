// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/MessageReader.h"
#include "Tools/Browse/Data/BrowsedFile.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <string>

namespace velmora {

/// Reads messages of a browsed file by their position; those in a row are read on, others from the index.
/// Main thread only.
class MessageCursor {
public:
    /// The file must outlive it.
    explicit MessageCursor(const BrowsedFile& file) : _file(file) {}

    /// Absent where it has not been read yet, and where it cannot be read any more (see `failure`).
    [[nodiscard]] std::optional<LoggedMessage> at(std::uint64_t position);
    /// The comments of the recording on the message that `at` last returned, joined by "; ".
    [[nodiscard]] const std::string& comments() const { return _comments; }
    [[nodiscard]] const std::string& failure() const { return _failure; }

private:
    [[nodiscard]] bool jumpTo(const RecordingIndex::Checkpoint& checkpoint);
    [[nodiscard]] std::optional<LoggedMessage> next();

    const BrowsedFile& _file;
    std::unique_ptr<MessageReader> _reader;
    std::uint64_t _next = 0; ///< the position of the message that the reader returns next
    std::string _comments;
    std::string _failure;
};

} // namespace velmora

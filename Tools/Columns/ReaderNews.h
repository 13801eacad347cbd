// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/InputColumns.h"
#include "Recording/MessageReader.h"

#include <cstddef>
#include <cstdint>

namespace velmora {

/// Passes a reader's comments and losses to the tables, each once and between the messages where it belongs:
/// the reader may be ahead of what is decoded.
class ReaderNews {
public:
    /// The reader must outlive it.
    explicit ReaderNews(const MessageReader& reader) : _reader(reader) {}

    /// The comments on messages up to that one.
    void passNotes(std::uint64_t message, InputColumns& columns);
    /// The losses before that message.
    void passLosses(std::uint64_t message, InputColumns& columns);
    /// What is left at the end of the input.
    void passEnd(InputColumns& columns);

private:
    const MessageReader& _reader;
    std::size_t _comments = 0;
    std::uint64_t _losses = 0;
};

} // namespace velmora

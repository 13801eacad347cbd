// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <cstdint>
#include <vector>

namespace velmora {

/// How some bytes become the content of a node (a dictionary or an array): a function, and the table that it
/// works by, which must be a constant that lives as long as the process.
///
/// A display is read every two seconds and written thousands of times in between. So what a record says is
/// not turned into text when it arrives: the node keeps the record's bytes and the writing, and writes when
/// somebody looks (`writeLater` of the node). Nobody can tell the difference but by the time that it takes.
template <class Node>
struct Writing {
    /// The same writing sets the same keys of a dictionary whatever the bytes, and removes none; of an array
    /// it makes all elements anew. It does not throw for any bytes that were given to `writeLater`.
    void (*write)(Node& node, Bytes bytes, const void* table) = nullptr;
    const void* table = nullptr;

    friend bool operator==(const Writing& a, const Writing& b) = default;
};

/// A writing with the bytes that it was last asked to write; the buffer is used again.
template <class Node>
struct LaterWriting {
    Writing<Node> writing;
    std::vector<std::uint8_t> bytes;
    std::uint64_t turn = 0; ///< the place among the node's changes; 0 when it has been written

    [[nodiscard]] bool isDue() const { return turn != 0; }
    void ask(const Writing<Node>& wanted, Bytes what, std::uint64_t when) {
        writing = wanted;
        bytes.assign(what.begin(), what.end());
        turn = when;
    }
};

} // namespace velmora

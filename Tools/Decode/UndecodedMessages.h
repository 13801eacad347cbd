// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/MessageReader.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace velmora {

/// The messages of a file that its decoder could not decode: the first of them one by one, and how many there
/// were.
class UndecodedMessages {
public:
    /// How many are kept one by one.
    static constexpr std::size_t maximumKept = MessageReader::maximumLosses;

    void add(const LoggedMessage& message, std::string reason);

    [[nodiscard]] std::uint64_t count() const { return _count; }

    /// Writes the kept ones and the number of all to standard error. Returns whether there was none.
    bool report(const std::string& title) const;

private:
    struct Message {
        std::uint64_t number;
        std::uint64_t offset;
        std::string reason;
    };
    std::vector<Message> _first;
    std::uint64_t _count = 0;
};

} // namespace velmora

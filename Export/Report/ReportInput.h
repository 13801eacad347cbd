// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// What a page says of a file that it was made from.
struct ReportInput {
    /// Something that could not be read or decoded.
    struct Loss {
        std::uint64_t number = 0; ///< the record's; 0 for none
        std::optional<std::uint64_t> offset;
        std::string reason;
    };
    struct Note {
        std::uint64_t number = 0; ///< the message's; 0 for one about the file
        std::string text;
    };

    std::string name;
    std::uint64_t messages = 0;
    std::uint64_t lastNumber = 0;
    std::optional<Time> first; ///< of the messages' times
    std::optional<Time> last;
    std::string failure; ///< why not all of it was read; empty where all was
    std::uint64_t losses = 0;
    std::uint64_t lostBytes = 0;
    std::vector<Loss> firstLosses;
    std::uint64_t noteCount = 0;
    std::vector<Note> notes; ///< the first ones
};

} // namespace velmora

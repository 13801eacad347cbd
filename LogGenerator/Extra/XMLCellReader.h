// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Extra/Cell.h"

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// Reads the XML form of the cell information array as the telephony service writes it: an array of
/// dictionaries whose values are strings and plain decimal integers. Everything else is left to the
/// property-list reader; what this reader accepts, that one would accept with the same result.
///
/// The lists that come one after another differ in little but their numbers. So the reader caches the
/// segments between two numbers (the end of one tag, keys, texts, the start of the next number) with their
/// meaning. A known segment is compared and not parsed again: the position right after a number is always the
/// same state of the grammar, so that the same text there has the same meaning.
class XMLCellReader {
public:
    /// Appends the cells; false where the text is not of that form.
    [[nodiscard]] bool read(std::string_view text, std::vector<Cell>& cells);

private:
    static constexpr std::size_t maximumSegments = 64;
    static constexpr std::uint8_t noNumber = 0xFF; ///< the list ends here
    static constexpr std::uint8_t unknownNumber = 0xFE;

    /// One element of a segment's meaning.
    struct Step {
        enum class Kind : std::uint8_t { BeginCell, Technology, Type, NotANumber };
        Kind kind = Kind::BeginCell;
        std::uint8_t value = 0;
    };
    struct Segment {
        std::string text;
        bool begins = false; ///< it is at the list's start, not after a number
        std::vector<Step> steps;
        std::uint8_t number = noNumber; ///< the index of the number that follows
        std::size_t next = 0;           ///< which segment followed last time
    };

    [[nodiscard]] const Segment* segmentAt(std::string_view rest, bool begins);
    [[nodiscard]] bool addSegment(std::string_view rest, bool begins);

    std::vector<Segment> _segments;
    std::size_t _last = 0; ///< the one that was met last
};

} // namespace velmora

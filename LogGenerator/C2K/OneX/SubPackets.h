// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogMessages/Record.h"

#include <cstddef>
#include <cstdint>

namespace velmora::C2K {

/// The result of a search for a sub-packet.
struct FoundSubPacket {
    enum class Outcome : std::uint8_t {
        Found,
        Missing, ///< there is none, or there was an error in size before it (which has been reported)
        PastEnd, ///< the search reached a header that is not inside the record
    };

    Outcome outcome = Outcome::Missing;
    int index = 0;          ///< from 0, of the sub-packet where the search ended
    std::size_t offset = 0; ///< its start in the record

    [[nodiscard]] bool found() const { return outcome == Outcome::Found; }
};

/// The sub-packets of a 1x record: their number at byte 14, the first at byte 17, each beginning with its id
/// (at 0) and its total size (16 bits at 2).
class SubPackets {
public:
    static constexpr std::size_t minimumLength = 17;

    /// Precondition: the record has the minimum length.
    explicit SubPackets(const Record& record) : _record(record) {}

    /// The first sub-packet of that id. One that ends 17 bytes or more past the record's end is an error in
    /// size: an error line, whatever its id, and the search is over. (One that ends less far past it is
    /// accepted, as intended; `contains` checks what it needs.)
    [[nodiscard]] FoundSubPacket find(std::uint8_t id) const;

    /// Whether the record holds the first `length` bytes from the sub-packet's start on; an error line where
    /// it does not. False for every search that ended past the end of the record.
    [[nodiscard]] bool contains(const FoundSubPacket& subPacket, std::size_t length,
                                std::uint16_t logCode) const;

    /// The record from the sub-packet's start on.
    [[nodiscard]] Record from(const FoundSubPacket& subPacket) const {
        return _record.part(subPacket.offset, _record.size() - subPacket.offset);
    }

    /// Id and size.
    static constexpr std::size_t headerLength = 4;

private:
    Record _record;
};

} // namespace velmora::C2K

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <cstdint>
#include <optional>
#include <vector>

namespace velmora {

/// A decoder's steps as an input. Any bytes are a script: a step starts with a byte whose remainder by 6 is
/// its kind, and a truncated step is used as far as it goes.
///
///     0  a record of the baseband's stream: u16 log code, u16 payload length, payload
///     1  one of the telephony service's extra stream, likewise
///     2  as 0, after the prefix 81 00
///     3  a message as it is: u16 length, bytes
///     4  a redraw
///     5  a reconnection: another decoder goes on with the same state
///
/// Numbers are little-endian. A record's header has its length and no time stamp.
class MessageScript {
public:
    enum class Kind : std::uint8_t { Message, Redraw, Reconnect };
    struct Step {
        Kind kind = Kind::Message;
        Data message;
    };

    explicit MessageScript(Bytes script) : _rest(script) {}

    /// The next step; none at the end.
    [[nodiscard]] std::optional<Step> next();

    /// A step as the script has it. The time stamp of a message that is a record goes, and its length field
    /// becomes right. Precondition: the message has at most 65535 bytes.
    [[nodiscard]] static std::vector<std::uint8_t> encode(const Step& step);

private:
    std::uint8_t takeByte();
    std::uint16_t takeU16();
    /// A u16 length and as many bytes.
    Bytes takeBytes();

    Bytes _rest;
};

} // namespace velmora

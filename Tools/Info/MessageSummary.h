// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Recording/MessageReader.h"

#include <cstdint>
#include <map>
#include <optional>

namespace velmora {

/// Counts of a recording, made message by message.
class MessageSummary {
public:
    /// Messages of one kind, and the position of the first.
    struct Count {
        std::uint64_t messages = 0;
        std::uint64_t firstNumber = 0;
        std::uint64_t firstOffset = 0;
    };

    /// `binary`: whether the messages are records with a header, which those of the serialized-object stream
    /// are not.
    explicit MessageSummary(bool binary) : _binary(binary) {}

    /// Returns the log code, of a message that has one.
    std::optional<std::uint32_t> add(const LoggedMessage& message);
    /// The message that was added last cannot be decoded.
    void addUndecoded(const LoggedMessage& message);

    [[nodiscard]] bool isBinary() const { return _binary; }
    [[nodiscard]] std::uint64_t messages() const { return _messages; }
    [[nodiscard]] std::uint64_t bytes() const { return _bytes; }
    /// The earliest and the latest time stamp; absent without messages.
    [[nodiscard]] const std::optional<Time>& first() const { return _first; }
    [[nodiscard]] const std::optional<Time>& last() const { return _last; }
    /// By log code, as LogMessage::logCode returns it.
    [[nodiscard]] const std::map<std::uint32_t, Count>& codes() const { return _codes; }
    /// Shorter than a header, which decoders drop.
    [[nodiscard]] const Count& tooShort() const { return _tooShort; }
    /// Of a type byte that is neither stream's, which decoders drop.
    [[nodiscard]] const Count& wrongType() const { return _wrongType; }
    /// Messages that end the application.
    [[nodiscard]] const Count& undecoded() const { return _undecoded; }
    /// With the two bytes before the record that decoders strip: not malformed.
    [[nodiscard]] const Count& prefixed() const { return _prefixed; }

private:
    bool _binary;
    std::uint64_t _messages = 0;
    std::uint64_t _bytes = 0;
    std::optional<Time> _first;
    std::optional<Time> _last;
    std::map<std::uint32_t, Count> _codes;
    Count _tooShort;
    Count _wrongType;
    Count _prefixed;
    Count _undecoded;
};

} // namespace velmora

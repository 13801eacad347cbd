// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Recording/MessageReader.h"

#include <cstdint>
#include <functional>
#include <map>
#include <optional>
#include <string>

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

    void add(const LoggedMessage& message);

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
};

/// A technology's names of log codes.
struct CodeNames {
    const char* heading = "sections";
    /// Returns an empty text for a code without subscriber. Null without a decoder.
    std::function<std::string(std::uint32_t code)> nameOf;
};

/// The summary as `info` prints it.
[[nodiscard]] std::string summaryText(const MessageSummary& summary, const std::string& technology,
                                      const CodeNames& names, const MessageReader& reader);

} // namespace velmora

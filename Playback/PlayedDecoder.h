// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/LogGenerator.h"
#include "Platform/Result.h"
#include "PropertyLists/Value.h"
#include "Recording/MessageReader.h"
#include "Recording/Refreshes/RefreshTicks.h"
#include "Recording/Refreshes/Refreshes.h"

#include <cstddef>
#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

namespace velmora {

/// Decodes messages of one technology as a drive goes on, with the refreshes that velmora-log gives them, and
/// continues from any state in which a decoder has been. The history of refreshes is kept on request only.
/// Main thread only.
class PlayedDecoder {
public:
    /// A message of the technology, by its short name, as it may be shown; absent where nothing of it may be.
    using Masking =
        std::function<std::optional<Data>(const LoggedMessage& message, std::string_view technology)>;

    /// All that the display after some message depends on.
    struct Checkpoint {
        Dictionary state;
        Value memory; ///< of the decoder
        Refreshes refreshes;
        Time now{};
        std::optional<Time> lastRefresh;
        std::uint64_t messages = 0;
        std::size_t size = 0; ///< of the state, in bytes
    };

    /// Fails where the technology, by its short name, has no decoder.
    static Result<std::unique_ptr<PlayedDecoder>> make(std::string_view technology, Masking masking);
    /// As above, to continue from there.
    static Result<std::unique_ptr<PlayedDecoder>> make(std::string_view technology, Masking masking,
                                                       const Checkpoint& checkpoint);

    /// Decodes the next message of the technology, after the refresh that is due before it.
    void take(const LoggedMessage& message);
    /// Does the refresh that follows the last message, at that time where it is known, unless it is done, and
    /// returns what a snapshot saves then.
    [[nodiscard]] ArrayRef saveLast(std::optional<Time> tick);
    /// When the latest refresh was; absent before the first.
    [[nodiscard]] std::optional<Time> lastRefresh() const { return _lastRefresh; }

    [[nodiscard]] Checkpoint checkpoint();
    /// The display after the latest message; none before the first.
    [[nodiscard]] Value display() { return _decoder->display(_state); }
    /// Whether the message, were it the next, follows a refresh.
    [[nodiscard]] bool refreshesBefore(const LoggedMessage& message) const;
    [[nodiscard]] const Refreshes& refreshes() const { return _refreshes; }
    /// How many messages have been decoded since the drive's start.
    [[nodiscard]] std::uint64_t messages() const { return _messages; }
    /// When the latest message arrived; absent before the first.
    [[nodiscard]] std::optional<Time> now() const;
    /// Messages that could not be decoded, and the reason of the latest.
    [[nodiscard]] std::uint64_t undecoded() const { return _undecoded; }
    [[nodiscard]] const std::string& undecodedReason() const { return _undecodedReason; }

    void setKeepsHistory(bool keeps);
    [[nodiscard]] LogGenerator& decoder() { return *_decoder; }

private:
    PlayedDecoder(std::string_view technology, Masking masking)
        : _technology(technology), _masking(std::move(masking)) {}
    void refresh(Time tick);
    void decode(const LoggedMessage& message);

    std::string _technology;
    Masking _masking;
    MessageClock _clock;
    std::unique_ptr<LogGenerator> _decoder;
    Dictionary _state;
    Refreshes _refreshes;
    Time _now{};
    std::optional<Time> _lastRefresh;
    std::uint64_t _messages = 0;
    std::uint64_t _undecoded = 0;
    std::string _undecodedReason;
    bool _keepsHistory = false;
};

} // namespace velmora

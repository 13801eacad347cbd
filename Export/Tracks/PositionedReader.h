// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Tracks/Position.h"
#include "Analysis/Tracks/Track.h"
#include "Recording/MessageReader.h"
#include "Recording/Positions/FixAssembler.h"

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <deque>
#include <functional>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace velmora {

/// Reads a file's messages with the position of each, by the file's own fixes. Reads ahead by up to the
/// largest gap between fixes, since a position needs the fix after it; no further than these limits, past
/// which messages have no position. Losses are reported as they are read, so up to that much early. Main
/// thread only.
class PositionedReader final : public MessageReader {
public:
    static constexpr std::size_t maximumMessages = 100'000;
    static constexpr std::size_t maximumFixes = 100'000;
    static constexpr std::size_t maximumBytes = std::size_t{64} << 20;

    /// Nothing has been read of `reader`, which must outlive it.
    explicit PositionedReader(MessageReader& reader, std::chrono::nanoseconds maximumGap = Track::defaultGap);
    ~PositionedReader() override;

    [[nodiscard]] std::optional<LoggedMessage> next() override;
    /// The position at the time of the message that `next` last returned.
    [[nodiscard]] const std::optional<Position>& position() const { return _position; }
    /// Passes each fix on as it is read, which may be before messages that arrived earlier.
    void setFixes(std::function<void(const Fix&)> fixes) { _onFix = std::move(fixes); }

    [[nodiscard]] const std::string& technology() const override { return _reader.technology(); }
    [[nodiscard]] std::vector<std::string> technologies() const override { return _reader.technologies(); }
    void setReadsAllTechnologies(bool all) override { _reader.setReadsAllTechnologies(all); }
    [[nodiscard]] std::string_view form() const override { return _reader.form(); }
    [[nodiscard]] const std::optional<Failure>& failure() const override { return _reader.failure(); }

private:
    void read();
    void take(const PositionSentence& sentence);
    void add(const std::optional<Fix>& fix);
    [[nodiscard]] bool mustWait() const;
    void addLosses();

    MessageReader& _reader;
    FixAssembler _assembler;
    Track _track;
    std::function<void(const Fix&)> _onFix;
    std::deque<LoggedMessage> _waiting;
    std::size_t _waitingBytes = 0;
    std::optional<Time> _latest; ///< of what was read last
    std::optional<Position> _position;
    bool _isAtEnd = false;
    std::uint64_t _losses = 0; ///< so many of the reader's have been added
    std::uint64_t _lostBytes = 0;
};

} // namespace velmora

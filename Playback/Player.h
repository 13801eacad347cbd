// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Playback/PlayedDecoder.h"
#include "Playback/PlayedFile.h"
#include "Playback/PlayedPicture.h"
#include "Playback/RecordingIndex.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <string>

namespace velmora {

/// Stands at a moment of a recording, between two messages of the shown technology, and moves to any other
/// that the index has read. What it shows there is what decoding all messages before the moment shows. Main
/// thread only.
class Player {
public:
    /// Stands before the first message. File and index must outlive this.
    static Result<std::unique_ptr<Player>> make(const PlayedFile& file, const RecordingIndex& index,
                                                PlayedDecoder::Masking masking);

    /// How many messages lie before the moment.
    [[nodiscard]] std::uint64_t position() const { return _decoder->messages(); }
    /// When the message before the moment arrived; absent at the front.
    [[nodiscard]] std::optional<Time> now() const { return _decoder->now(); }
    /// When the message after the moment arrived; absent at the end of what the index has read.
    [[nodiscard]] std::optional<Time> next();
    /// Why a message could not be read; empty where that has not happened.
    [[nodiscard]] const std::string& failure() const { return _failure; }

    /// Moves to where that many messages lie before the moment, or to the end.
    void seekToMessage(std::uint64_t messages);
    /// Moves to before the first message that arrived at that time or later. Where time stamps go back, the
    /// file's order counts.
    void seekToTime(Time time);
    /// Moves on until the next message is later than the time, by as many messages at most. Whether it has
    /// got there.
    bool playTo(Time time, std::uint64_t atMost);
    /// Moves to the next refresh, or the end.
    void stepToNextRefresh();
    /// Moves to the last refresh before the moment, or the front.
    void stepToEarlierRefresh();

    /// The display at the moment; none before the first message.
    [[nodiscard]] Value display() { return _decoder->display(); }
    /// What the messages before the moment have reported of the radio network.
    [[nodiscard]] const RadioPicture& picture() const { return _picture->picture(); }
    /// What a snapshot of the moment saves, and the time of its last refresh.
    struct Saved {
        ArrayRef contents;
        std::optional<Time> refresh;
    };
    [[nodiscard]] Saved saved() const;

private:
    /// The messages of the technology that follow a checkpoint.
    struct Reading {
        std::unique_ptr<MessageReader> reader;
        std::unique_ptr<PlayedDecoder> decoder;
    };

    Player(const PlayedFile& file, const RecordingIndex& index, PlayedDecoder::Masking masking)
        : _file(file), _index(index), _masking(std::move(masking)) {}

    [[nodiscard]] Result<Reading> readingFrom(const RecordingIndex::Checkpoint& checkpoint) const;
    [[nodiscard]] std::optional<LoggedMessage> nextOf(MessageReader& reader) const;
    bool jumpTo(const RecordingIndex::Checkpoint& checkpoint);
    /// Reads the next message, which stays to be taken. False at the end.
    [[nodiscard]] bool lookAhead();
    bool takeNext();
    [[nodiscard]] bool isAtRefresh();
    void goOnTo(std::uint64_t messages);

    const PlayedFile& _file;
    const RecordingIndex& _index;
    PlayedDecoder::Masking _masking;
    std::unique_ptr<MessageReader> _reader;
    std::unique_ptr<PlayedDecoder> _decoder;
    std::unique_ptr<PlayedPicture> _picture; ///< of the decoder
    std::uint64_t _losses = 0;               ///< of the reader, that the picture has got
    std::optional<LoggedMessage> _ahead;
    std::string _failure;
};

} // namespace velmora

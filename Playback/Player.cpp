// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Playback/Player.h"

#include "Playback/QuietDecoding.h"

#include <utility>

namespace velmora {

Result<std::unique_ptr<Player>> Player::make(const PlayedFile& file, const RecordingIndex& index,
                                             PlayedDecoder::Masking masking) {
    const QuietDecoding quiet;
    std::unique_ptr<Player> player(new Player(file, index, std::move(masking)));
    if (!player->jumpTo(index.checkpoints().front()))
        return Failure{player->_failure};
    return player;
}

Result<Player::Reading> Player::readingFrom(const RecordingIndex::Checkpoint& checkpoint) const {
    Result<std::unique_ptr<MessageReader>> reader = _file.from(checkpoint.place);
    if (!reader)
        return Failure{reader.reason()};
    Result<std::unique_ptr<PlayedDecoder>> decoder =
        checkpoint.decoder ? PlayedDecoder::make(_index.technology(), _masking, *checkpoint.decoder)
                           : PlayedDecoder::make(_index.technology(), _masking);
    if (!decoder)
        return Failure{decoder.reason()};
    return Reading{*std::move(reader), *std::move(decoder)};
}

std::optional<LoggedMessage> Player::nextOf(MessageReader& reader) const {
    std::optional<LoggedMessage> message = reader.next();
    while (message && !_index.has(*message))
        message = reader.next();
    return message;
}

bool Player::jumpTo(const RecordingIndex::Checkpoint& checkpoint) {
    Result<Reading> reading = readingFrom(checkpoint);
    if (!reading) {
        _failure = reading.reason();
        return false;
    }
    _failure.clear();
    _ahead.reset();
    _picture.reset(); // of the earlier decoder
    _reader = std::move(reading->reader);
    _decoder = std::move(reading->decoder);
    _picture = std::make_unique<PlayedPicture>(_decoder->decoder(),
                                               checkpoint.decoder ? &checkpoint.picture : nullptr);
    _losses = 0;
    return true;
}

bool Player::lookAhead() {
    if (_ahead)
        return true;
    if (position() >= _index.messages())
        return false;
    _ahead = nextOf(*_reader);
    if (!_ahead)
        _failure = _reader->failure()
                       ? _reader->failure()->reason
                       : "message " + std::to_string(position() + 1) + " is not there any more";
    return _ahead.has_value();
}

bool Player::takeNext() {
    if (!lookAhead())
        return false;
    if (const std::uint64_t losses = _reader->lossTotals().losses; std::exchange(_losses, losses) != losses)
        _picture->damaged();
    const std::uint64_t undecoded = _decoder->undecoded();
    _decoder->take(*_ahead);
    if (_decoder->undecoded() != undecoded)
        _picture->undecoded(_ahead->time);
    _ahead.reset();
    return true;
}

std::optional<Time> Player::next() {
    return lookAhead() ? std::optional(_ahead->time) : std::nullopt;
}

void Player::goOnTo(std::uint64_t messages) {
    while (position() < messages && takeNext()) {
    }
}

void Player::seekToMessage(std::uint64_t messages) {
    const QuietDecoding quiet;
    const RecordingIndex::Checkpoint& checkpoint = _index.beforeMessage(messages);
    if ((position() > messages || position() < checkpoint.messages()) && !jumpTo(checkpoint))
        return;
    goOnTo(messages);
}

void Player::seekToTime(Time time) {
    const QuietDecoding quiet;
    if (!jumpTo(_index.beforeTime(time)))
        return;
    while (lookAhead() && _ahead->time < time)
        takeNext();
}

bool Player::playTo(Time time, std::uint64_t atMost) {
    const QuietDecoding quiet;
    while (lookAhead() && _ahead->time <= time) {
        if (atMost-- == 0)
            return false;
        takeNext();
    }
    return true;
}

/// Whether a refresh shows the display as it is at the moment.
bool Player::isAtRefresh() {
    if (position() == 0)
        return false;
    return !_decoder->refreshes().last() || !lookAhead() || _decoder->refreshesBefore(*_ahead);
}

void Player::stepToNextRefresh() {
    const QuietDecoding quiet;
    while (takeNext() && !isAtRefresh()) {
    }
}

void Player::stepToEarlierRefresh() {
    const QuietDecoding quiet;
    const std::uint64_t moment = position();
    std::uint64_t end = moment;
    std::uint64_t found = 0;
    while (end > 0 && found == 0) {
        const RecordingIndex::Checkpoint& checkpoint = _index.beforeMessage(end - 1);
        if (!jumpTo(checkpoint))
            return;
        for (; position() < end; takeNext()) {
            if (isAtRefresh() && _failure.empty())
                found = position();
            if (!lookAhead())
                break;
        }
        end = checkpoint.messages();
    }
    seekToMessage(found);
}

Player::Saved Player::saved() const {
    const QuietDecoding quiet;
    // One refresh more than the history holds, so that all that it keeps begin with one.
    constexpr std::uint64_t kept = 6;
    const bool isPending = _decoder->refreshes().last().has_value();
    const std::uint64_t refreshes = _decoder->refreshes().count() + (isPending ? 1 : 0);
    const std::uint64_t begin = refreshes < kept ? 0 : refreshes - kept;
    const RecordingIndex::Checkpoint& checkpoint =
        refreshes < kept ? _index.checkpoints().front() : _index.beforeRefresh(begin);
    const Result<Reading> reading = readingFrom(checkpoint);
    if (!reading)
        return {};
    PlayedDecoder& decoder = *reading->decoder;
    std::optional<LoggedMessage> message;
    while (decoder.messages() < position() && (message = nextOf(*reading->reader))) {
        decoder.setKeepsHistory(decoder.refreshes().count() >= begin);
        decoder.take(*message);
    }
    std::optional<Time> tick;
    if (_file.reader().form() == "snapshot") // which names its refreshes
        while (isPending && !tick && (message = nextOf(*reading->reader)))
            tick = message->refresh;
    return {decoder.saveLast(tick), decoder.lastRefresh()};
}

} // namespace velmora

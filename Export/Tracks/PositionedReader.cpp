// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Tracks/PositionedReader.h"

#include "Platform/TimeSpan.h"

#include <utility>

namespace velmora {

namespace {

/// By how much records of merged files may be out of the order of their times.
constexpr std::chrono::nanoseconds disorder = std::chrono::seconds(1);

} // namespace

PositionedReader::PositionedReader(MessageReader& reader, std::chrono::nanoseconds maximumGap)
    : _reader(reader), _track(maximumGap) {
    if (reader.isCompressed())
        setCompressed();
    reader.setSentences([this](const PositionSentence& sentence) { take(sentence); });
}

PositionedReader::~PositionedReader() {
    _reader.setSentences({});
}

std::optional<LoggedMessage> PositionedReader::next() {
    _position.reset();
    while (!_isAtEnd && mustWait())
        read();
    if (_waiting.empty())
        return std::nullopt;
    std::optional<LoggedMessage> message = std::move(_waiting.front());
    _waiting.pop_front();
    _waitingBytes -= message->message.bytes().size();
    _position = _track.at(message->time);
    _track.discardBefore(timeAfter(message->time, -disorder));
    return message;
}

bool PositionedReader::mustWait() const {
    if (_waiting.empty())
        return true;
    if (_waiting.size() >= maximumMessages || _waitingBytes >= maximumBytes)
        return false;
    const Time time = _waiting.front().time;
    const std::optional<Time> pending = _assembler.pending();
    const bool isOpen =
        _track.isOpenAt(time) || (pending && *pending <= timeAfter(time, _track.maximumGap()));
    // Where the clock was set meanwhile, no fix that matters comes any more.
    const Time end = timeAfter(timeAfter(time, _track.maximumGap()), FixAssembler::longestEpoch);
    return isOpen && *_latest <= end && timeSpan(*_latest, time) <= _track.maximumGap();
}

void PositionedReader::read() {
    std::optional<LoggedMessage> message = _reader.next();
    addLosses();
    if (!message) {
        add(_assembler.finish());
        _isAtEnd = true;
        return;
    }
    add(_assembler.completeAt(message->time));
    _latest = message->time;
    _waitingBytes += message->message.bytes().size();
    _waiting.push_back(*std::move(message));
}

void PositionedReader::take(const PositionSentence& sentence) {
    _latest = sentence.time;
    add(_assembler.add(sentence));
}

void PositionedReader::add(const std::optional<Fix>& fix) {
    if (!fix)
        return;
    // Where the clock was set back, what came before is of another time.
    const std::deque<Fix>& fixes = _track.fixes();
    if (!fixes.empty() && timeSpan(fix->time, fixes.back().time) > disorder)
        _track = Track(_track.maximumGap());
    // Where no message asks for them they must not pile up.
    if (_waiting.empty())
        _track.discardBefore(timeAfter(fix->time, -_track.maximumGap()));
    if (fixes.size() < maximumFixes)
        _track.add(*fix);
    if (_onFix)
        _onFix(*fix);
}

void PositionedReader::addLosses() {
    const std::vector<Loss>& kept = _reader.losses();
    const LossTotals& totals = _reader.lossTotals();
    for (; _losses < totals.losses; ++_losses) {
        Loss loss;
        if (_losses < kept.size())
            loss = kept[static_cast<std::size_t>(_losses)];
        else
            loss.bytes = totals.bytes - _lostBytes; // of all that have no place of their own
        _lostBytes += loss.bytes;
        addLoss(std::move(loss));
    }
    for (Comment& comment : _reader.takeNewComments())
        addComment(std::move(comment));
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Playback/PlayedDecoder.h"

#include "LogGenerator/Extra/ExtraPayload.h"
#include "LogGenerator/GSM/AssertionFailure.h"
#include "Platform/TelephonyService.h"
#include "Playback/StateCopy.h"

#include <utility>

namespace velmora {

Result<std::unique_ptr<PlayedDecoder>> PlayedDecoder::make(std::string_view technology, Masking masking) {
    std::unique_ptr<PlayedDecoder> made(new PlayedDecoder(technology, std::move(masking)));
    made->_decoder = LogGenerator::generatorFromTechnology(technologyConstant(technology), made->_clock);
    if (!made->_decoder)
        return Failure{(technology.empty() ? "the file names no technology"
                                           : "technology \"" + std::string(technology) + "\" is unknown") +
                       ", wanted one of " + technologyNames()};
    made->_decoder->setKeepsHistory(false);
    return made;
}

Result<std::unique_ptr<PlayedDecoder>> PlayedDecoder::make(std::string_view technology, Masking masking,
                                                           const Checkpoint& checkpoint) {
    Result<std::unique_ptr<PlayedDecoder>> made = make(technology, std::move(masking));
    if (!made)
        return made;
    PlayedDecoder& decoder = **made;
    decoder._state = StateCopy(checkpoint.state).take();
    decoder._decoder->setMemory(checkpoint.memory);
    decoder._refreshes = checkpoint.refreshes;
    decoder._now = checkpoint.now;
    decoder._lastRefresh = checkpoint.lastRefresh;
    decoder._messages = checkpoint.messages;
    return made;
}

PlayedDecoder::Checkpoint PlayedDecoder::checkpoint() {
    static_cast<void>(display()); // writes what is pending into the state
    StateCopy copy(_state);
    return {copy.take(), _decoder->memory(), _refreshes, _now, _lastRefresh, _messages, copy.size()};
}

void PlayedDecoder::setKeepsHistory(bool keeps) {
    _keepsHistory = keeps;
    _decoder->setKeepsHistory(keeps);
}

bool PlayedDecoder::refreshesBefore(const LoggedMessage& message) const {
    Refreshes ahead = _refreshes;
    return ahead.before(message).has_value();
}

std::optional<Time> PlayedDecoder::now() const {
    return _messages == 0 ? std::nullopt : std::optional(_now);
}

void PlayedDecoder::take(const LoggedMessage& message) {
    if (const std::optional<Time> tick = _refreshes.before(message))
        refresh(*tick);
    decode(message);
    _now = message.time;
    ++_messages;
    if (const std::optional<Time> tick = _refreshes.after(message))
        refresh(*tick);
}

void PlayedDecoder::decode(const LoggedMessage& message) {
    _clock.setNow(message.time);
    const std::optional<Data> shown = _masking ? _masking(message, _technology) : message.message;
    if (!shown)
        return;
    try {
        _decoder->updateState(_state, *shown);
        return;
    } catch (const LogCode_0xFF0000::UnknownDataException& failure) {
        _undecodedReason = failure.what();
    } catch (const AssertionFailure& failure) {
        _undecodedReason = failure.what();
    }
    ++_undecoded;
}

ArrayRef PlayedDecoder::saveLast(std::optional<Time> tick) {
    setKeepsHistory(true);
    if (const std::optional<Time> last = _refreshes.last())
        refresh(tick.value_or(*last));
    return _decoder->getSaveContentsFromState(_state);
}

void PlayedDecoder::refresh(Time tick) {
    _refreshes.done();
    _lastRefresh = tick;
    _clock.setNow(tick);
    // Without a reader of the history, a refresh shows nothing that the next message would not find.
    if (_keepsHistory || !_state.contains("Display"))
        static_cast<void>(_decoder->generateLogUsingState(_state));
}

} // namespace velmora

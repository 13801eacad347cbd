// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/TechnologyDecoder.h"

#include "LogGenerator/Extra/ExtraPayload.h"
#include "LogGenerator/GSM/AssertionFailure.h"
#include "Platform/TelephonyService.h"
#include "Tools/Technologies.h"

#include <utility>

namespace velmora {

Result<std::unique_ptr<TechnologyDecoder>> TechnologyDecoder::make(const std::string& technology,
                                                                   SharedDecoding& shared) {
    std::unique_ptr<TechnologyDecoder> made(new TechnologyDecoder(technology, shared));
    Result<std::unique_ptr<LogGenerator>> decoder = makeDecoder(technology, made->_clock);
    if (!decoder)
        return Failure{decoder.reason()};
    made->_decoder = *std::move(decoder);
    if (shared.checkDecoder)
        shared.checkDecoder(*made->_decoder);
    shared.observer.didMakeDecoder(*made->_decoder);
    made->_keepsHistory = shared.observer.wantsHistory(0);
    made->_decoder->setKeepsHistory(made->_keepsHistory);
    return made;
}

TechnologyDecoder::TechnologyDecoder(const std::string& technology, SharedDecoding& shared)
    : _shared(shared) {
    _decoded.technology = shortTechnologyName(technology);
}

void TechnologyDecoder::skip(const LoggedMessage& message) {
    if (const std::optional<Time> tick = _refreshes.afterSkipped(message))
        refresh(*tick);
}

void TechnologyDecoder::refresh(Time tick) {
    _refreshes.done();
    _decoded.refreshes = _refreshes.count();
    _clock.setNow(tick);
    const bool writes = _shared.filter.writes(tick);
    // A refresh without a reader is skipped, unless there is no display yet: then it logs the reason.
    if (_keepsHistory || (_shared.wantsEveryRefresh && writes) || !_state.contains("Display"))
        _decoded.display = _decoder->generateLogUsingState(_state);
    if (writes) {
        announce();
        _shared.observer.didRefresh(tick, _decoded);
    }
    if (_shared.observer.wantsHistory(_refreshes.count()) != _keepsHistory) {
        _keepsHistory = !_keepsHistory;
        _decoder->setKeepsHistory(_keepsHistory);
    }
}

void TechnologyDecoder::decode(const LoggedMessage& message) {
    _clock.setNow(message.time);
    const bool writes = _shared.filter.writes(message.time);
    if (writes) {
        announce();
        _shared.observer.willDecode(message);
    }
    std::optional<std::string> reason = update(message, writes ? _shared.effects : nullptr);
    ++_decoded.messages;
    if (reason)
        _shared.undecoded.add(message, *std::move(reason));
    else if (writes)
        _shared.observer.didDecode(message, *_decoder, _state);
    if (const std::optional<Time> tick = _refreshes.after(message))
        refresh(*tick);
}

std::optional<std::string> TechnologyDecoder::update(const LoggedMessage& message, MessageEffects* effects) {
    if (_shared.isStrict) {
        callOn(message, effects);
        return std::nullopt;
    }
    try {
        callOn(message, effects);
        return std::nullopt;
    } catch (const LogCode_0xFF0000::UnknownDataException& failure) {
        return failure.what();
    } catch (const AssertionFailure& failure) {
        return failure.what();
    }
}

void TechnologyDecoder::callOn(const LoggedMessage& message, MessageEffects* effects) {
    if (effects)
        _decoder->updateStateReporting(_state, message.message, *effects);
    else
        _decoder->updateState(_state, message.message);
}

void TechnologyDecoder::finish() {
    if (_refreshes.count() != 0 && !_keepsHistory)
        _decoded.display = _decoder->display(_state);
    announce();
    _shared.observer.didFinish(*_decoder, _state);
}

void TechnologyDecoder::announce() {
    if (_shared.observed == this)
        return;
    _shared.observed = this;
    _shared.observer.willConcern(_decoded);
}

} // namespace velmora

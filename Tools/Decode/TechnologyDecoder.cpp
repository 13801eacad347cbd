// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/TechnologyDecoder.h"

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

void TechnologyDecoder::finish() {
    if (_refreshes.count() != 0 && !_keepsHistory)
        _decoded.display = _decoder->display(_state);
    announce();
    _shared.observer.didFinish(*_decoder, _state);
}

} // namespace velmora

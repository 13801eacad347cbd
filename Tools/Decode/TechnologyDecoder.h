// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Extra/ExtraPayload.h"
#include "LogGenerator/GSM/AssertionFailure.h"
#include "LogGenerator/LogGenerator.h"
#include "PropertyLists/Value.h"
#include "Recording/Refreshes/RefreshTicks.h"
#include "Recording/Refreshes/Refreshes.h"
#include "Tools/Decode/Decoding.h"
#include "Tools/Messages/MessageSelection.h"

#include <functional>
#include <memory>
#include <optional>
#include <string>

namespace velmora {

class TechnologyDecoder;

/// What the decoders of a file's technologies share.
struct SharedDecoding {
    DecodingObserver& observer;
    MessageFilter filter;
    bool isStrict;
    std::function<void(LogGenerator&)> checkDecoder;
    MessageEffects* effects;
    bool wantsEveryRefresh;
    /// The one that the observer's next calls concern, as it has been told; null after a change.
    const TechnologyDecoder* observed = nullptr;
    UndecodedMessages undecoded = {};
};

/// Decodes one technology of a file, with a decoder, a state and refreshes of its own.
class TechnologyDecoder {
public:
    /// Fails where the technology has no decoder. `shared` must outlive it.
    [[nodiscard]] static Result<std::unique_ptr<TechnologyDecoder>> make(const std::string& technology,
                                                                         SharedDecoding& shared);
    TechnologyDecoder(const TechnologyDecoder&) = delete;
    TechnologyDecoder& operator=(const TechnologyDecoder&) = delete;

    /// A message of this technology is not selected.
    void skip(const LoggedMessage& message);
    /// The refresh that is due before this message of this technology.
    [[nodiscard]] std::optional<Time> refreshBefore(const LoggedMessage& message) {
        return _refreshes.before(message);
    }
    /// The refresh that is due by the time of a message of another technology.
    [[nodiscard]] std::optional<Time> refreshBy(Time time) { return _refreshes.by(time); }
    /// The refresh after the last message.
    [[nodiscard]] std::optional<Time> lastRefresh() const { return _refreshes.last(); }
    void refresh(Time tick);
    /// Decodes a message of this technology, once the refresh that was due before it is done.
    void decode(const LoggedMessage& message);
    /// There are no more messages, and the last refresh is done.
    void finish();

    [[nodiscard]] Decoded& decoded() { return _decoded; }

private:
    TechnologyDecoder(const std::string& technology, SharedDecoding& shared);

    void callOn(const LoggedMessage& message, MessageEffects* effects);
    /// Says which technology the observer's next calls concern.
    void announce();

    SharedDecoding& _shared;
    MessageClock _clock;
    std::unique_ptr<LogGenerator> _decoder;
    Dictionary _state;
    Refreshes _refreshes;
    Decoded _decoded;
    bool _keepsHistory = false;
};

// Here, since there are millions of messages: the calls would show.

inline void TechnologyDecoder::announce() {
    if (_shared.observed == this)
        return;
    _shared.observed = this;
    _shared.observer.willConcern(_decoded);
}

inline void TechnologyDecoder::callOn(const LoggedMessage& message, MessageEffects* effects) {
    if (effects)
        _decoder->updateStateReporting(_state, message.message, *effects);
    else
        _decoder->updateState(_state, message.message);
}

inline void TechnologyDecoder::decode(const LoggedMessage& message) {
    _clock.setNow(message.time);
    const bool writes = _shared.filter.writes(message.time);
    if (writes) {
        announce();
        _shared.observer.willDecode(message);
    }
    MessageEffects* const effects = writes ? _shared.effects : nullptr;
    bool isDecoded = true;
    if (_shared.isStrict) {
        callOn(message, effects);
    } else {
        try {
            callOn(message, effects);
        } catch (const LogCode_0xFF0000::UnknownDataException& failure) {
            _shared.undecoded.add(message, failure.what());
            isDecoded = false;
        } catch (const AssertionFailure& failure) {
            _shared.undecoded.add(message, failure.what());
            isDecoded = false;
        }
    }
    ++_decoded.messages;
    if (isDecoded && writes)
        _shared.observer.didDecode(message, *_decoder, _state);
    if (const std::optional<Time> tick = _refreshes.after(message))
        refresh(*tick);
}

} // namespace velmora

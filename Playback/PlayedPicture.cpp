// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Playback/PlayedPicture.h"

#include <algorithm>
#include <utility>

namespace velmora {

PlayedPicture::PlayedPicture(LogGenerator& decoder, const Memory* memory)
    : _decoder(decoder), _picture(decoder.catalogue()), _checks(_picture.catalogue().technology(), *this),
      _isContinued(memory != nullptr) {
    if (memory) {
        _picture.setMemory(memory->picture);
        if (memory->last)
            _checks.continueFrom(*memory->last);
        _messages = memory->messages;
    }
    decoder.setObservationSink(this);
}

PlayedPicture::~PlayedPicture() {
    _decoder.setObservationSink(nullptr);
}

void PlayedPicture::undecoded(Time arrival) {
    ObservedMessage nothing{};
    nothing.arrival = arrival;
    nothing.damage = Damage::Unreadable;
    report(nothing);
}

void PlayedPicture::observed(const ObservedMessage& message) {
    if (std::exchange(_isContinued, false) && _picture.catalogue().root().isOpen())
        reportFirst(message);
    else
        report(message);
}

void PlayedPicture::reportFirst(ObservedMessage message) {
    std::vector<const CatalogueField*> removed;
    for (const CatalogueField& each : _picture.catalogue().fields()) {
        const auto isHere = [&each](const Observation& observation) { return observation.leaf == &each; };
        if (std::none_of(message.observations.begin(), message.observations.end(), isHere))
            removed.push_back(&each);
    }
    message.removed = removed;
    report(message);
}

void PlayedPicture::report(const ObservedMessage& message) {
    const MessageReport report{{0, ++_messages}, message.arrival, message};
    if (_checks.isInterruption(report))
        _picture.clear();
    _checks.report(report);
    if (message.damage == Damage::None)
        _picture.update(report);
}

} // namespace velmora

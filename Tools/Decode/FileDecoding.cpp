// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/FileDecoding.h"

#include "Platform/TelephonyService.h"
#include "Tools/Decode/DecodeProgress.h"
#include "Tools/Decode/TrackedResources.h"
#include "Tools/Report.h"

#include <algorithm>
#include <cstddef>
#include <optional>
#include <utility>

namespace velmora {

Result<DecodedFile> FileDecoding::run() {
    using Several = DecodingRequest::Several;
    const TrackedResources resources;
    _reader.setReadsAllTechnologies(_request.several != Several::First);
    // The first message before the technology: a file may name it no earlier than there.
    std::optional<LoggedMessage> message = _reader.next();
    if (const Result<Done> begun = begin(); !begun)
        return Failure{begun.reason()};
    bool more = message.has_value();
    if (more && !_shared.observer.isDone())
        take(*message);
    message.reset(); // releases its part of the reader's buffer
    while (more && !_shared.observer.isDone()) {
        // Constructed in place: a move of each of millions of messages would show.
        const std::optional<LoggedMessage> next = _reader.next();
        more = next.has_value();
        if (more)
            take(*next);
    }
    if (refuses())
        return Failure{severalTechnologies(known())};
    DecodedFile decoded = finish();
    if (!resources.failure().empty())
        return Failure{"decoded without its template: " + resources.failure()};
    return decoded;
}

Result<Done> FileDecoding::begin() {
    const std::vector<std::string> technologies = known();
    Result<TechnologyChoice> choice = TechnologyChoice::make(_request.technology, technologies);
    if (!choice)
        return Failure{choice.reason()};
    _choice = *std::move(choice);
    if (refuses())
        return Failure{severalTechnologies(technologies)};
    if (_choice.only)
        _shared.filter.setTechnology(*_choice.only);
    else if (!_choice.override.empty())
        _reader.setReadsAllTechnologies(false);
    const std::uint32_t first = _choice.only.value_or(0);
    if (const std::string& reason = at(first).reason; !reason.empty())
        return Failure{reason +
                       (_choice.nameOf(first, technologies).empty() ? "; --technology supplies it" : "")};
    if (technologies.size() > 1)
        noteSeveral();
    return Done{};
}

void FileDecoding::take(const LoggedMessage& message) {
    if (_request.progress)
        _request.progress->at(message.offset);
    if (!_shared.filter.passes(message)) {
        if (message.technology < _technologies.size() && _technologies[message.technology].decoder)
            _technologies[message.technology].decoder->skip(message);
        return;
    }
    const Technology& technology = at(message.technology);
    if (_technologies.size() > 1)
        refreshAllBefore(message);
    else if (const std::optional<Time> tick = technology.decoder->refreshBefore(message))
        technology.decoder->refresh(*tick);
    _context.atRecord(message.number, message.offset);
    if (technology.decoder)
        technology.decoder->decode(message);
    else
        _shared.undecoded.add(message, technology.reason);
}

FileDecoding::Technology& FileDecoding::make(std::uint32_t index) {
    if (index < _technologies.size() && !_technologies[index].reason.empty())
        return _technologies[index];
    if (index >= _technologies.size())
        _technologies.resize(index + 1);
    Technology& technology = _technologies[index];
    Result<std::unique_ptr<TechnologyDecoder>> decoder =
        TechnologyDecoder::make(_choice.nameOf(index, known()), _shared);
    if (decoder)
        technology.decoder = *std::move(decoder);
    else
        technology.reason = decoder.reason();
    if (index > 0 || _hasSeveral)
        noteSeveral();
    return technology;
}

/// Where the technologies are refreshed one by one, the order is that of the time.
void FileDecoding::refreshAllBefore(const LoggedMessage& message) {
    for (std::size_t i = 0; i < _technologies.size(); ++i) {
        TechnologyDecoder* const decoder = _technologies[i].decoder.get();
        if (!decoder)
            continue;
        const std::optional<Time> tick =
            i == message.technology ? decoder->refreshBefore(message) : decoder->refreshBy(message.time);
        if (tick)
            _due.push_back({*tick, decoder});
    }
    refreshDue();
}

void FileDecoding::refreshDue() {
    std::stable_sort(_due.begin(), _due.end(),
                     [](const DueRefresh& a, const DueRefresh& b) { return a.tick < b.tick; });
    for (const DueRefresh& due : _due)
        due.decoder->refresh(due.tick);
    _due.clear();
}

void FileDecoding::noteSeveral() {
    if (!decodesAll())
        return;
    _hasSeveral = true;
    _shared.observed = nullptr;
    for (const Technology& technology : _technologies)
        if (technology.decoder)
            technology.decoder->decoded().isOneOfSeveral = true;
}

DecodedFile FileDecoding::finish() {
    const std::vector<std::string> technologies = known();
    if (technologies.size() > 1)
        noteSeveral();
    for (const Technology& technology : _technologies)
        if (technology.decoder)
            if (const std::optional<Time> tick = technology.decoder->lastRefresh())
                _due.push_back({*tick, technology.decoder.get()});
    refreshDue();
    DecodedFile decoded;
    for (std::size_t i = 0; i < std::max(_technologies.size(), technologies.size()); ++i) {
        if (i < _technologies.size() && _technologies[i].decoder) {
            _technologies[i].decoder->finish();
            decoded.technologies.push_back(std::move(_technologies[i].decoder->decoded()));
        } else if (_hasSeveral && isTechnology(technologies[i])) {
            // One that is named, and has no message.
            Decoded& empty = decoded.technologies.emplace_back();
            empty.technology = technologies[i];
            empty.isOneOfSeveral = true;
        }
    }
    decoded.undecoded = std::move(_shared.undecoded);
    return decoded;
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Passes/SearchPass.h"

#include "LogMessages/LogMessage.h"
#include "Playback/QuietDecoding.h"

#include <algorithm>
#include <utility>

namespace velmora {

namespace {

void fold(std::string& text) {
    for (char& each : text)
        if (each >= 'A' && each <= 'Z')
            each = static_cast<char>(each - 'A' + 'a');
}

} // namespace

SearchPass::SearchPass(const BrowsedFile& file, Query query)
    : _file(file), _query(std::move(query)), _cursor(file), _decoder(file, *this),
      _begin(_query.direction == Direction::Forward ? _query.from + 1 : _query.from) {
    fold(_query.text);
}

bool SearchPass::step() {
    const QuietDecoding quiet;
    if (_query.direction == Direction::Forward) {
        const std::uint64_t end = std::min(_begin + 2048, _file.messages());
        if (_begin >= end || !_decoder.standBefore(_begin))
            return false;
        searchTo(end);
        _begin = std::max(end, _begin + 1);
        return !_found && _begin < _file.messages();
    }
    if (_begin == 0)
        return false;
    const std::uint64_t end = _begin;
    _begin = _file.index().beforeMessage(end - 1).messages();
    if (!_decoder.standBefore(_begin))
        return false;
    searchTo(end);
    return !_found && _begin > 0;
}

/// Forward, the first match ends it; backward, the last one counts.
void SearchPass::searchTo(std::uint64_t end) {
    while (_decoder->messages() < end) {
        const std::uint64_t position = _decoder->messages();
        const std::optional<LoggedMessage> message = _cursor.at(position);
        if (!message)
            return;
        _isReported = false;
        _decoder->take(*message);
        if (position < _begin || (_query.isListed && !_query.isListed(position)))
            continue;
        if (!_isReported && !isMatch(*message, position))
            continue;
        _found = position;
        if (_query.direction == Direction::Forward)
            return;
    }
}

bool SearchPass::has(std::string text) const {
    fold(text);
    return text.find(_query.text) != std::string::npos;
}

bool SearchPass::isMatch(const LoggedMessage& message, std::uint64_t position) {
    if (has(_cursor.comments()) || (_query.noteOf && has(_query.noteOf(position))))
        return true;
    const std::optional<LogMessage> parsed = LogMessage::parse(message.message.bytes());
    return parsed && has(_file.nameOf(parsed->logCode()));
}

void SearchPass::observed(const ObservedMessage& message) {
    for (const Observation& each : message.observations) {
        _path.clear();
        each.appendPath(_path);
        _path += ' ';
        _path += _text.of(each);
        fold(_path);
        if (_path.find(_query.text) != std::string::npos) {
            _isReported = true;
            return;
        }
    }
}

} // namespace velmora

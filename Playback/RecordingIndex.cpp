// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Playback/RecordingIndex.h"

#include "Platform/TelephonyService.h"
#include "Playback/QuietDecoding.h"
#include "Recording/OpenMessages.h"

#include <algorithm>
#include <utility>

namespace velmora {

namespace {

std::size_t sizeOf(const RecordingIndex::Checkpoint& checkpoint) {
    std::size_t size = sizeof checkpoint + (checkpoint.decoder ? checkpoint.decoder->size : 0) +
                       checkpoint.picture.picture.size();
    if (checkpoint.place.recording)
        size += sizeof *checkpoint.place.recording + checkpoint.place.recording->interfaces.size() *
                                                         sizeof(checkpoint.place.recording->interfaces[0]);
    return size;
}

/// The last one for which `isBefore`; the first is for all.
template <class IsBefore>
const RecordingIndex::Checkpoint& lastOf(const std::vector<RecordingIndex::Checkpoint>& checkpoints,
                                         IsBefore isBefore) {
    const auto end = std::partition_point(checkpoints.begin() + 1, checkpoints.end(), isBefore);
    return *(end - 1);
}

} // namespace

Result<std::unique_ptr<RecordingIndex>> RecordingIndex::make(PlayedFile& file, const std::string& technology,
                                                             PlayedDecoder::Masking masking, Limits limits) {
    const QuietDecoding quiet;
    std::unique_ptr<RecordingIndex> index(new RecordingIndex(file, limits));
    index->_checkpoints.push_back({file.place(), std::nullopt});
    index->_ahead = file.next(); // a file may name its technology no earlier than there
    if (const Result<Done> chosen = index->choose(technology); !chosen)
        return Failure{chosen.reason()};
    Result<std::unique_ptr<PlayedDecoder>> decoder =
        PlayedDecoder::make(index->_technology, std::move(masking));
    if (!decoder)
        return Failure{decoder.reason()};
    index->_decoder = *std::move(decoder);
    return index;
}

Result<Done> RecordingIndex::choose(const std::string& technology) {
    _technology = technology.empty() ? _file.reader().technology() : technology;
    if (_technology == _file.reader().technology())
        return Done{};
    // One that the file does not begin with: it may hold it later, or none that it names.
    const std::vector<std::string> named = technologiesOf(_file.path());
    _isOverridden = named.size() < 2;
    if (_isOverridden || std::find(named.begin(), named.end(), _technology) != named.end())
        return Done{};
    std::string text = "holds";
    for (const std::string& name : named)
        text += (&name == &named.front() ? " " : &name == &named.back() ? " and " : ", ") + name;
    return Failure{text + ", wanted one of these and not " + _technology};
}

bool RecordingIndex::has(const LoggedMessage& message) const {
    if (_isOverridden)
        return true;
    if (message.technology == 0)
        return _technology == _file.reader().technology();
    if (message.technology >= _isShown.size()) {
        _isShown.clear();
        for (const std::string& name : _file.reader().technologies())
            _isShown.push_back(name == _technology);
    }
    return message.technology < _isShown.size() && _isShown[message.technology];
}

bool RecordingIndex::read(std::uint64_t messages) {
    const QuietDecoding quiet;
    for (; messages > 0 && !_isComplete; --messages) {
        if (_decoder->messages() >= _checkpoints.back().messages() + _spacing && !_ahead)
            addCheckpoint();
        const std::optional<LoggedMessage> message =
            _ahead ? std::exchange(_ahead, std::nullopt) : _file.next();
        if (_file.reader().lossTotals().losses != _losses)
            reportLosses();
        if (!message)
            finish();
        else if (has(*message))
            take(*message);
    }
    return !_isComplete;
}

void RecordingIndex::reportLosses() {
    _losses = _file.reader().lossTotals().losses;
    const std::vector<Loss>& kept = _file.reader().losses();
    if (_pass)
        _pass->damaged(_losses <= kept.size() ? std::string_view(kept.back().reason) : "damaged");
}

/// Those on the latest message, of the first ones in the file, which are kept.
void RecordingIndex::reportNotes() {
    const Comments& comments = _file.reader().comments();
    for (; _comments < comments.first().size(); ++_comments)
        if (const Comment& each = comments.first()[_comments]; _pass && each.about == Comment::About::Message)
            _pass->noted(each.text);
    _comments = comments.count();
}

void RecordingIndex::finish() {
    _isComplete = true;
    if (!_pass)
        return;
    if (const std::string failure = _file.failure(); !failure.empty())
        _pass->damaged(failure);
    _pass->finished();
}

void RecordingIndex::take(const LoggedMessage& message) {
    _decoder->take(message);
    if (!_first)
        _first = message.time;
    _latest = std::max(_latest, message.time);
    const bool isUndecoded = _decoder->undecoded() != _undecoded.messages;
    if (isUndecoded && _pass)
        _pass->undecoded(message.time);
    if (_file.reader().comments().count() != _comments)
        reportNotes();
    if (!isUndecoded)
        return;
    if (++_undecoded.messages == 1) {
        _undecoded.number = message.number;
        _undecoded.offset = message.offset;
        _undecoded.reason = _decoder->undecodedReason();
    }
}

void RecordingIndex::addCheckpoint() {
    _checkpoints.push_back(
        {_file.place(), _decoder->checkpoint(), _latest, _pass ? _pass->memory() : PlayedPicture::Memory()});
    _memory += sizeOf(_checkpoints.back());
    while (_memory > _memoryLimit && _checkpoints.size() > 2)
        thinOut();
}

/// Removes every other checkpoint but the first, the drive's start, and has later ones farther apart.
void RecordingIndex::thinOut() {
    std::size_t kept = 1;
    for (std::size_t i = 2; i < _checkpoints.size(); i += 2)
        _checkpoints[kept++] = std::move(_checkpoints[i]);
    _checkpoints.resize(kept);
    _spacing *= 2;
    _memory = 0;
    for (const Checkpoint& checkpoint : _checkpoints)
        _memory += sizeOf(checkpoint);
}

const RecordingIndex::Checkpoint& RecordingIndex::beforeMessage(std::uint64_t messages) const {
    return lastOf(_checkpoints, [messages](const Checkpoint& each) { return each.messages() <= messages; });
}

const RecordingIndex::Checkpoint& RecordingIndex::beforeRefresh(std::uint64_t refreshes) const {
    return lastOf(_checkpoints,
                  [refreshes](const Checkpoint& each) { return each.refreshes() <= refreshes; });
}

const RecordingIndex::Checkpoint& RecordingIndex::beforeTime(Time time) const {
    return lastOf(_checkpoints, [time](const Checkpoint& each) { return each.latest < time; });
}

} // namespace velmora

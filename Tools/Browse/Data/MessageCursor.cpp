// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Data/MessageCursor.h"

#include <utility>

namespace velmora {

bool MessageCursor::jumpTo(const RecordingIndex::Checkpoint& checkpoint) {
    Result<std::unique_ptr<MessageReader>> reader = _file.file().from(checkpoint.place);
    if (!reader) {
        _failure = reader.reason();
        return false;
    }
    _failure.clear();
    _reader = *std::move(reader);
    _next = checkpoint.messages();
    return true;
}

std::optional<LoggedMessage> MessageCursor::next() {
    std::optional<LoggedMessage> message = _reader->next();
    while (message && !_file.index().has(*message))
        message = _reader->next();
    ++_next;
    // Taken with each message, since a reader keeps but the first ones.
    _comments.clear();
    for (const Comment& each : _reader->takeNewComments())
        if (message && each.about == Comment::About::Message && each.number == message->number)
            _comments += (_comments.empty() ? "" : "; ") + each.text;
    return message;
}

std::optional<LoggedMessage> MessageCursor::at(std::uint64_t position) {
    if (position >= _file.messages())
        return std::nullopt;
    const RecordingIndex::Checkpoint& checkpoint = _file.index().beforeMessage(position);
    const bool goesOn = _reader && _next <= position && checkpoint.messages() <= _next;
    if (!goesOn && !jumpTo(checkpoint))
        return std::nullopt;
    while (_next < position)
        if (!next())
            break;
    std::optional<LoggedMessage> message = _next == position ? next() : std::nullopt;
    if (!message) {
        _failure = _reader->failure() ? _reader->failure()->reason
                                      : "message " + std::to_string(position + 1) + " is not there any more";
        _reader.reset();
    }
    return message;
}

} // namespace velmora

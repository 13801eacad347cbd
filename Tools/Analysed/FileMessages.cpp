// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Analysed/FileMessages.h"

#include "Recording/OpenMessages.h"

#include <optional>
#include <utility>

namespace velmora {

Result<Done> FileMessages::run(const std::function<bool()>& isDone) {
    _reader.setReadsAllTechnologies(true);
    // The first message before the technology: a file may name it no earlier than there.
    std::optional<LoggedMessage> first = _reader.next();
    if (const Result<Done> begun = begin(); !begun)
        return Failure{begun.reason()};
    bool more = first.has_value();
    if (more)
        take(*first);
    first.reset(); // releases its part of the reader's buffer
    while (more && !(isDone && isDone())) {
        // Constructed in place: a move of each of millions of messages would show.
        const std::optional<LoggedMessage> next = _reader.next();
        more = next.has_value();
        if (more)
            take(*next);
    }
    if (!more && _reader.failure())
        _feed.reportLoss({{_file.input, 0}, _reader.failure()->reason});
    else if (!more)
        reportNewLosses(0);
    return Done{};
}

Result<Done> FileMessages::begin() {
    if (!_file.technology.empty())
        _known = technologiesOf(_file.path);
    const std::vector<std::string> technologies = knownTechnologies(_known, _reader);
    Result<TechnologyChoice> choice = TechnologyChoice::make(_file.technology, technologies);
    if (!choice)
        return Failure{choice.reason()};
    _choice = *std::move(choice);
    if (!_choice.only && !_choice.override.empty())
        _reader.setReadsAllTechnologies(false);
    const std::uint32_t index = _choice.only.value_or(0);
    if (const std::string& reason = at(index).reason; !reason.empty())
        return Failure{reason +
                       (_choice.nameOf(index, technologies).empty() ? "; --technology supplies it" : "")};
    return Done{};
}

void FileMessages::take(const LoggedMessage& message) {
    if (_progress)
        _progress->at(message.offset);
    reportNewLosses(message.number);
    if (_choice.only && message.technology != *_choice.only)
        return;
    const Technology& technology = at(message.technology);
    _context.atRecord(message.number, message.offset);
    if (!technology.feed) {
        _undecoded.add(message, technology.reason);
        return;
    }
    if (const std::optional<std::string> reason = technology.feed->decode(message, _file.input))
        _undecoded.add(message, *reason);
    reportNewNotes(*technology.feed);
}

/// Those on the latest message.
void FileMessages::reportNewNotes(TechnologyFeed& feed) {
    for (const Comment& comment : _reader.takeNewComments())
        if (comment.about == Comment::About::Message)
            feed.analysis().reportNote({{_file.input, comment.number}, comment.text});
}

FileMessages::Technology& FileMessages::at(std::uint32_t index) {
    if (index >= _technologies.size())
        _technologies.resize(index + 1);
    Technology& technology = _technologies[index];
    if (technology.feed || !technology.reason.empty())
        return technology;
    const Result<TechnologyFeed*> feed = _feed.of(_choice.nameOf(index, knownTechnologies(_known, _reader)));
    if (feed)
        technology.feed = *feed;
    else
        technology.reason = feed.reason();
    return technology;
}

/// Those since the latest message. `number`: the next one's; 0 at the end of the file.
void FileMessages::reportNewLosses(std::uint64_t number) {
    const std::uint64_t losses = _reader.lossTotals().losses;
    if (losses == _losses)
        return;
    const std::vector<Loss>& kept = _reader.losses();
    // The reasons of later ones are not kept; that messages are missing is what counts.
    const bool isKept = losses <= kept.size();
    const InputLoss loss{{_file.input, isKept ? kept.back().recordNumber : number},
                         isKept ? std::string_view(kept.back().reason) : "damaged"};
    _losses = losses;
    _feed.reportLoss(loss);
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/BrowseSession.h"

#include "LogMessages/LogMessage.h"
#include "Platform/PrintableText.h"
#include "Tools/Browse/Data/MarkedCopy.h"

#include <algorithm>
#include <chrono>

namespace velmora {

namespace {

/// How long a step may take, so that keys do not wait.
constexpr std::chrono::milliseconds stepTime{12};

std::string percent(std::uint64_t done, std::uint64_t all) {
    return std::to_string(all == 0 ? 0 : done * 100 / all) + " %";
}

} // namespace

Result<std::unique_ptr<BrowseSession>> BrowseSession::open(const std::string& path,
                                                           const std::string& technology,
                                                           const std::optional<MaskOptions>& masking,
                                                           Rules rules) {
    Result<std::unique_ptr<BrowsedFile>> file = BrowsedFile::open(path, technology, masking);
    if (!file)
        return Failure{file.reason()};
    return std::unique_ptr<BrowseSession>(new BrowseSession(*std::move(file), std::move(rules)));
}

BrowseSession::BrowseSession(std::unique_ptr<BrowsedFile> file, Rules rules)
    : _file(std::move(file)), _rules(std::move(rules)), _cursor(*_file), _inspector(*_file) {}

bool BrowseSession::work() {
    const auto end = std::chrono::steady_clock::now() + stepTime;
    bool goesOn = true;
    do
        goesOn = workOn();
    while (goesOn && std::chrono::steady_clock::now() < end);
    takePending();
    return goesOn;
}

/// What the user waits for comes first.
bool BrowseSession::workOn() {
    constexpr std::uint64_t messages = 1000;
    if (!_file->isComplete()) {
        _file->readOn(messages);
        return true;
    }
    if (_search) {
        if (_search->step())
            return true;
        if (_search->found()) {
            choosePosition(*_search->found());
        } else if (!_search->failure().empty()) {
            _news = "the search ended early: " + printable(_search->failure());
        } else {
            const bool isForward = _search->query().direction == SearchPass::Direction::Forward;
            _news = std::string(isForward ? "no later" : "no earlier") + " message has \"" +
                    printable(_search->query().text) + "\"";
        }
        _search.reset();
        return true;
    }
    if (_filter && !_filter->isDone()) {
        const bool wasEmpty = isEmpty();
        if (!_filter->step(messages) && isEmpty())
            _news = "no message passes the filter; f with an empty one lists all";
        if (_filter->isDone() && _filter->position() < _file->messages())
            _news = "filtered as far as the file could be read, to message " +
                    std::to_string(_filter->position());
        if (wasEmpty && !isEmpty())
            choosePosition(_position);
        return true;
    }
    if (!_events && !_file->index().first())
        return false; // an empty file
    if (!_events)
        _events = std::make_unique<EventPass>(*_file, _rules());
    return !_events->isDone() && _events->step(messages);
}

void BrowseSession::takePending() {
    const bool isRead = _file->isComplete() && (!_filter || _filter->isDone());
    if (_wantedTime && (isRead || _file->index().last() > _wantedTime))
        chooseTime(*std::exchange(_wantedTime, std::nullopt));
    if (isRead && std::exchange(_wantsLast, false))
        choose(listed() - std::min<std::uint64_t>(listed(), 1));
}

std::string BrowseSession::progress() const {
    if (!_file->isComplete())
        return "reading, " +
               std::to_string(static_cast<int>(std::min(_file->file().progress(), 0.99) * 100)) + " %";
    if (_search)
        return "searching, message " + std::to_string(_search->position());
    if (_filter && !_filter->isDone())
        return "filtering, " + percent(_filter->position(), _file->messages());
    if (_events && !_events->isDone())
        return "finding events, " + percent(_events->position(), _file->messages());
    return {};
}

std::uint64_t BrowseSession::listed() const {
    return _filter ? _filter->matches().size() : _file->messages();
}

std::optional<std::uint64_t> BrowseSession::positionAt(std::uint64_t index) const {
    if (index >= listed())
        return std::nullopt;
    return _filter ? _filter->matches()[index] : index;
}

std::uint64_t BrowseSession::chosen() const {
    if (!_filter)
        return _position;
    const std::vector<std::uint32_t>& matches = _filter->matches();
    return static_cast<std::uint64_t>(std::lower_bound(matches.begin(), matches.end(), _position) -
                                      matches.begin());
}

void BrowseSession::choose(std::uint64_t index) {
    _wantsLast = false;
    _wantedTime.reset();
    if (isEmpty())
        return;
    _position = *positionAt(std::min(index, listed() - 1));
}

void BrowseSession::chooseLast() {
    choose(listed());
    _wantsLast = true;
    takePending();
}

void BrowseSession::choosePosition(std::uint64_t position) {
    if (!_filter) {
        choose(position);
        return;
    }
    const std::vector<std::uint32_t>& matches = _filter->matches();
    choose(static_cast<std::uint64_t>(std::lower_bound(matches.begin(), matches.end(), position) -
                                      matches.begin()));
}

std::uint64_t BrowseSession::positionOf(Time time) {
    std::uint64_t position = _file->index().beforeTime(time).messages();
    for (; position + 1 < _file->messages(); ++position)
        if (const auto message = _cursor.at(position); !message || message->time >= time)
            break;
    return position;
}

void BrowseSession::chooseTime(Time time) {
    if (!_file->isComplete() && !(_file->index().last() > time)) {
        _wantedTime = time;
        return;
    }
    choosePosition(positionOf(time));
}

bool BrowseSession::chooseEvent(SearchPass::Direction direction) {
    if (!_events)
        return false;
    const std::vector<BrowsedEvent>& events = _events->events();
    // By the messages that made them, since what is chosen is a message.
    std::optional<std::uint64_t> found;
    for (const BrowsedEvent& each : events) {
        if (direction == SearchPass::Direction::Forward && each.position > _position)
            found = std::min(found.value_or(each.position), each.position);
        if (direction == SearchPass::Direction::Backward && each.position < _position)
            found = std::max(found.value_or(each.position), each.position);
    }
    if (found)
        choosePosition(*found);
    return found.has_value();
}

std::vector<MessageRow> BrowseSession::rows(std::uint64_t first, std::size_t count) {
    std::vector<MessageRow> rows;
    std::optional<Time> before;
    if (const auto position = first > 0 ? positionAt(first - 1) : std::nullopt)
        if (const auto message = _cursor.at(*position))
            before = message->time;
    const auto range = marked();
    for (std::uint64_t i = first; rows.size() < count; ++i) {
        const std::optional<std::uint64_t> position = positionAt(i);
        const std::optional<LoggedMessage> message = position ? _cursor.at(*position) : std::nullopt;
        if (!message)
            break;
        MessageRow row;
        row.position = *position;
        row.time = message->time;
        if (before) // in unsigned numbers, since a damaged file may have any times
            row.difference = Time::duration(
                static_cast<Time::rep>(static_cast<std::uint64_t>(message->time.time_since_epoch().count()) -
                                       static_cast<std::uint64_t>(before->time_since_epoch().count())));
        before = message->time;
        row.bytes = message->message.size();
        if (const auto parsed = LogMessage::parse(message->message.bytes())) {
            row.code = parsed->logCode();
            row.name = _file->nameOf(*row.code);
        }
        row.note = note(*position);
        if (const std::string& comments = _cursor.comments(); !comments.empty())
            row.note += (row.note.empty() ? "" : "; ") + printable(comments);
        row.isMarked = range && *position >= range->first && *position <= range->second;
        rows.push_back(std::move(row));
    }
    return rows;
}

const InspectedMessage* BrowseSession::message() {
    return isEmpty() ? nullptr : _inspector.inspect(_position);
}

Result<Done> BrowseSession::setFilter(const std::string& text) {
    if (text.empty()) {
        _filter.reset();
        return Done{};
    }
    Result<std::unique_ptr<FilterPass>> filter = FilterPass::make(*_file, text);
    if (!filter)
        return Failure{filter.reason()};
    _filter = *std::move(filter);
    return Done{};
}

void BrowseSession::search(const std::string& text, SearchPass::Direction direction) {
    SearchPass::Query query{text, direction, _position, {}, {}};
    if (_filter)
        query.isListed = [this](std::uint64_t position) {
            const std::vector<std::uint32_t>& matches = _filter->matches();
            return std::binary_search(matches.begin(), matches.end(), position);
        };
    query.noteOf = [this](std::uint64_t position) { return note(position); };
    _search = std::make_unique<SearchPass>(*_file, std::move(query));
}

void BrowseSession::setNote(const std::string& text) {
    if (isEmpty())
        return;
    if (text.empty())
        _notes.erase(_position);
    else
        _notes[_position] = text;
    _hasUnwritten = !_notes.empty();
}

std::string BrowseSession::note(std::uint64_t position) const {
    const auto found = _notes.find(position);
    return found == _notes.end() ? std::string() : printable(found->second);
}

void BrowseSession::toggleMark() {
    _mark = _mark ? std::nullopt : std::optional(_position);
}

std::optional<std::pair<std::uint64_t, std::uint64_t>> BrowseSession::marked() const {
    if (!_mark)
        return std::nullopt;
    return std::minmax(*_mark, _position);
}

std::vector<std::string> BrowseSession::otherTechnologies() const {
    std::vector<std::string> names = _file->file().reader().technologies();
    const auto own = std::find(names.begin(), names.end(), _file->index().technology());
    if (own == names.end())
        return {}; // the messages are taken as another one's
    std::rotate(names.begin(), own, names.end());
    names.erase(names.begin());
    return names;
}

Result<std::uint64_t> BrowseSession::write(const std::string& path) {
    MarkedCopy copy;
    copy.input = _file->path();
    copy.output = path;
    copy.technology = _file->index().technology();
    copy.notes = _notes;
    copy.masking = _file->masking();
    if (const auto range = marked()) {
        copy.first = range->first;
        copy.last = range->second;
    }
    Result<std::uint64_t> written = copy.write();
    if (written)
        _hasUnwritten = false;
    return written;
}

} // namespace velmora

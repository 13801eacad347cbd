// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/LineBrowser.h"

#include "Export/Masking/MaskKey.h"
#include "Platform/PrintableText.h"
#include "Tools/Browse/BrowseTime.h"
#include "Tools/Browse/Screen/RowText.h"
#include "Tools/ExitStatus.h"
#include "Tools/Report.h"

#include <algorithm>
#include <iostream>
#include <utility>

namespace velmora {

namespace {

constexpr std::string_view help =
    "an empty line: the next message   b: the one before   NUMBER: that message   $: the last one\n"
    "c: what the message changed   d: the display   x: its fields and where they lie   h: its bytes   "
    "l: events\n"
    "/TEXT: search, n: again, N: backwards   f CONDITION or CODES: filter, f alone: all\n"
    "e, E: next, previous event   t TIME: go there   m TEXT: a note, m alone: none\n"
    "v: begin or drop a range   w FILE: write it to a new recording\n"
    ">, <: next, previous file   T: the next technology of the file   ?: this list   q: quit\n";

} // namespace

void LineBrowser::print(std::string_view line) {
    _output.put(std::string(line) + "\n");
}

void LineBrowser::print(const Result<Done>& result) {
    if (!result)
        print(printable(result.reason()));
}

bool LineBrowser::openFile(std::size_t index, const std::string& technology) {
    Result<std::unique_ptr<BrowseSession>> session = _open(_files[index], technology);
    if (!session) {
        report(_files[index] + ": " + session.reason());
        return false;
    }
    _session = *std::move(session);
    _file = index;
    finishWork();
    print(printable(_files[_file]) + ": " + std::to_string(_session->listed()) + " messages, " +
          printable(_session->file().index().technology()) + (_session->file().masking() ? ", masked" : ""));
    printMessage();
    return true;
}

int LineBrowser::run() {
    if (!openFile(0))
        return ExitStatus::BadInput;
    _output.flush();
    std::string line;
    while (_output.isOpen() && std::getline(std::cin, line) && take(line))
        _output.flush();
    _output.flush();
    return _output.state() == Output::State::Failed ? ExitStatus::BadInput : ExitStatus::Done;
}

void LineBrowser::finishWork() {
    while (_session->work()) {
    }
    if (const std::string news = _session->takeNews(); !news.empty())
        print(news);
}

bool LineBrowser::take(std::string_view line) {
    using Direction = SearchPass::Direction;
    const char command = line.empty() ? ' ' : line[0];
    std::string rest(line.substr(std::min<std::size_t>(line.size(), 1)));
    rest.erase(0, std::min(rest.find_first_not_of(' '), rest.size()));
    const std::uint64_t chosen = _session->chosen();
    const std::uint64_t position = _session->position();
    switch (command) {
    case 'q': return false;
    case '?': _output.put(std::string(help)); return true;
    case ' ': _session->choose(chosen + 1); break;
    case 'b': _session->choose(chosen - std::min<std::uint64_t>(chosen, 1)); break;
    case '$': _session->chooseLast(); break;
    case 'c': printDisplay(true); return true;
    case 'd': printDisplay(false); return true;
    case 'x': printFields(); return true;
    case 'h': printBytes(); return true;
    case 'l': printEvents(); return true;
    case '/': find(rest, Direction::Forward); break;
    case 'n': find(_query, Direction::Forward); break;
    case 'N': find(_query, Direction::Backward); break;
    case 'f': print(_session->setFilter(rest)); break;
    case 'e':
    case 'E':
        if (!_session->chooseEvent(command == 'e' ? Direction::Forward : Direction::Backward))
            print("no further event");
        break;
    case 't': goTo(rest); break;
    case 'm': _session->setNote(rest); break;
    case 'v': _session->toggleMark(); break;
    case 'w': {
        const Result<std::uint64_t> written = _session->write(rest);
        print(written ? std::to_string(*written) + " messages written" : printable(written.reason()));
        return true;
    }
    case 'T': changeTechnology(); return true;
    case '>':
    case '<': {
        const std::size_t next = command == '>' ? _file + 1 : _file - 1;
        if (next >= _files.size())
            print("no further file");
        else if (!openFile(next))
            print("the file before stays open");
        return true;
    }
    default:
        if (command < '0' || command > '9') {
            print("? lists the commands");
            return true;
        }
        _session->choose(std::max<std::uint64_t>(std::strtoull(std::string(line).c_str(), nullptr, 10), 1) -
                         1);
    }
    finishWork();
    if (_session->position() == position && command == ' ')
        print("the last message");
    printMessage();
    return true;
}

void LineBrowser::changeTechnology() {
    for (const std::string& name : _session->otherTechnologies())
        if (openFile(_file, name))
            return;
    print("no other technology in the file");
}

void LineBrowser::find(const std::string& text, SearchPass::Direction direction) {
    if (!text.empty())
        _query = text;
    if (!_query.empty())
        _session->search(_query, direction);
}

void LineBrowser::goTo(const std::string& text) {
    const InspectedMessage* const message = _session->message();
    const std::optional<Time> first = _session->file().index().first();
    if (!message || !first)
        return;
    const Result<Time> time = browsedTime(text, *first, message->message.time);
    if (time)
        _session->chooseTime(*time);
    else
        print(printable(time.reason()));
}

void LineBrowser::printMessage() {
    const std::vector<MessageRow> rows = _session->rows(_session->chosen(), 1);
    if (rows.empty())
        print(_session->isEmpty() ? "no messages" : "cannot be read any more");
    else
        print("message" + rowText(rows.front()).substr(1));
}

void LineBrowser::printDisplay(bool changesAlone) {
    const InspectedMessage* const message = _session->message();
    if (!message)
        return;
    for (const DisplayRow& row : message->rows)
        if (!row.isBranch && (!changesAlone || row.hasChanged))
            print(printable(row.path) + " = " + row.value + (row.hasChanged ? " (changed)" : "") +
                  (row.isOld ? " (old)" : ""));
}

void LineBrowser::printFields() {
    const InspectedMessage* const message = _session->message();
    if (!message)
        return;
    for (const ReportedField& field : message->fields)
        print(printable(fieldText(field)));
}

void LineBrowser::printBytes() {
    if (const InspectedMessage* const message = _session->message())
        print(hexadecimalText(message->message.message.bytes()));
}

void LineBrowser::printEvents() {
    if (const EventPass* const events = _session->events())
        for (const BrowsedEvent& event : events->events())
            print("message " + std::to_string(event.position + 1) + ": " + eventText(event));
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Browser.h"

#include "Platform/PrintableText.h"
#include "Tools/Browse/BrowseTime.h"
#include "Tools/Browse/Screen/BrowseLayout.h"
#include "Tools/Browse/Screen/RowText.h"

#include <algorithm>
#include <utility>

namespace velmora {

Result<std::unique_ptr<Browser>> Browser::make(std::vector<std::string> files, Open open, Host host) {
    std::unique_ptr<Browser> browser(new Browser(std::move(files), std::move(open), std::move(host)));
    if (const Result<Done> opened = browser->openFile(0); !opened)
        return Failure{opened.reason()};
    return browser;
}

Browser::Browser(std::vector<std::string> files, Open open, Host host)
    : _files(std::move(files)), _open(std::move(open)), _host(std::move(host)), _opened(_files.size()) {}

Result<Done> Browser::openFile(std::size_t index, const std::string& technology) {
    OpenedFile& file = _opened[index];
    std::string name = technology.empty() ? file.technology : technology;
    if (!file.sessions.contains(name)) {
        Result<std::unique_ptr<BrowseSession>> session = _open(_files[index], technology);
        if (!session)
            return Failure{_files[index] + ": " + session.reason()};
        name = (*session)->file().index().technology();
        file.sessions[name] = *std::move(session);
    }
    file.technology = std::move(name);
    _file = index;
    return Done{};
}

bool Browser::work() {
    const bool goesOn = session().work();
    if (const std::string news = session().takeNews(); !news.empty())
        _news = news;
    return goesOn;
}

void Browser::take(const KeyPress& press, ScreenSize size) {
    _news.clear();
    if (_prompt) {
        switch (_prompt->take(press)) {
        case Prompt::Outcome::GoesOn: return;
        case Prompt::Outcome::Cancelled: _prompt.reset(); return;
        case Prompt::Outcome::Finished: break;
        }
        const Prompt prompt = *std::exchange(_prompt, std::nullopt);
        prompt.finish(); // which may ask something else
        return;
    }
    if (std::exchange(_showsHelp, false))
        return;
    if (session().isSearching()) {
        session().stopSearch();
        _news = "search stopped";
        return;
    }
    takeCommand(press, size);
}

void Browser::takeCommand(const KeyPress& press, ScreenSize size) {
    const bool wasLeaving = std::exchange(_isLeaving, false);
    if (press.key == Key::Interrupt || press.text == "q") {
        _isLeaving = wasLeaving;
        quit();
        return;
    }
    if (press.key == Key::Tab || press.key == Key::BackTab) {
        changePart(press.key == Key::Tab ? 1 : -1);
        return;
    }
    const Key key = scrollKey(press);
    if (key != Key::Character)
        move(key, size);
    else if (press.text.size() == 1)
        takeLetter(press.text[0]);
}

void Browser::takeLetter(char letter) {
    using Direction = SearchPass::Direction;
    switch (letter) {
    case '?': _showsHelp = true; break;
    case '/':
        ask("Search: ", {}, [this](const std::string& text) {
            if (!text.empty())
                _query = text;
            search(Direction::Forward);
        });
        break;
    case 'n': search(Direction::Forward); break;
    case 'N': search(Direction::Backward); break;
    case 'f': askFilter(); break;
    case 't': askTime(); break;
    case 'm': askNote(); break;
    case 'v': session().toggleMark(); break;
    case 'w': askFile(); break;
    case 'y': copy(); break;
    case 'e':
    case 'E':
        if (!session().chooseEvent(letter == 'e' ? Direction::Forward : Direction::Backward))
            _news = letter == 'e' ? "no later event" : "no earlier event";
        break;
    case ']': changeSection(1); break;
    case '[': changeSection(-1); break;
    case 'T': changeTechnology(); break;
    case '>': changeFile(1); break;
    case '<': changeFile(-1); break;
    default: _news = "? shows the keys"; break;
    }
}

void Browser::move(Key key, ScreenSize size) {
    const BrowseLayout layout = BrowseLayout::of(size);
    const std::size_t lower = std::max<std::size_t>(layout.lowerRows, 1);
    if (_part == BrowsePart::Display)
        return moveInDisplay(key, lower);
    if (_part == BrowsePart::Content)
        return moveInBytes(key, layout.bytesPerLine, lower);
    BrowseSession& moved = session();
    if (_part == BrowsePart::Events && (key == Key::Up || key == Key::Down)) {
        takeLetter(key == Key::Up ? 'E' : 'e');
        return;
    }
    const std::uint64_t chosen = moved.chosen();
    const std::uint64_t page = std::max<std::size_t>(layout.listRows, 2) - 1;
    switch (key) {
    case Key::Up: moved.choose(chosen - std::min<std::uint64_t>(chosen, 1)); break;
    case Key::Down: moved.choose(chosen + 1); break;
    case Key::PageUp: moved.choose(chosen - std::min(chosen, page)); break;
    case Key::PageDown: moved.choose(chosen + page); break;
    case Key::Home: moved.choose(0); break;
    case Key::End: moved.chooseLast(); break;
    default: break;
    }
}

void Browser::moveInDisplay(Key key, std::size_t page) {
    const InspectedMessage* const message = session().message();
    if (!message || message->rows.empty())
        return;
    const std::size_t row = displayRow(*message);
    const std::size_t last = message->rows.size() - 1;
    std::size_t next = row;
    switch (key) {
    case Key::Up: next = row - std::min<std::size_t>(row, 1); break;
    case Key::Down: next = std::min(row + 1, last); break;
    case Key::PageUp: next = row - std::min(row, page); break;
    case Key::PageDown: next = std::min(row + page, last); break;
    case Key::Home: next = 0; break;
    case Key::End: next = last; break;
    default: break;
    }
    _displayPath = message->rows[next].path;
}

void Browser::moveInBytes(Key key, std::size_t perLine, std::size_t page) {
    const InspectedMessage* const message = session().message();
    if (!message || message->message.message.empty())
        return;
    const std::size_t last = message->message.message.size() - 1;
    const auto back = [this](std::size_t count) { return _byte - std::min(_byte, count); };
    switch (key) {
    case Key::Left: _byte = back(1); break;
    case Key::Right: ++_byte; break;
    case Key::Up: _byte = _byte >= perLine ? _byte - perLine : _byte; break;
    case Key::Down: _byte = _byte + perLine <= last ? _byte + perLine : _byte; break;
    case Key::PageUp: _byte = back(perLine * page); break;
    case Key::PageDown: _byte += perLine * page; break;
    case Key::Home: _byte = 0; break;
    case Key::End: _byte = last; break;
    default: break;
    }
    _byte = std::min(_byte, last);
    if (const ReportedField* const field = chosenField(*message))
        _displayPath = field->path;
}

void Browser::changePart(int step) {
    constexpr int parts = 4;
    _part = static_cast<BrowsePart>((static_cast<int>(_part) + parts + step) % parts);
    const InspectedMessage* const message = session().message();
    if (_part != BrowsePart::Content || !message)
        return;
    // The cursor begins where the row's value lies.
    for (const ReportedField& field : message->fields)
        if (field.path == _displayPath && field.place)
            _byte = field.place->begin;
}

void Browser::changeFile(int step) {
    const std::size_t next = _file + static_cast<std::size_t>(step);
    if (next >= _files.size()) { // also below 0
        _news = step > 0 ? "no file after this one" : "no file before this one";
        return;
    }
    if (const Result<Done> opened = openFile(next); !opened)
        _news = printable(opened.reason());
}

/// At the same time as before.
void Browser::changeTechnology() {
    const std::vector<std::string> others = session().otherTechnologies();
    const InspectedMessage* const message = session().message();
    const std::optional<Time> time = message ? std::optional(message->message.time) : std::nullopt;
    _news = "no other technology in the file";
    for (const std::string& name : others) {
        // There may be some without a decoder.
        const Result<Done> opened = openFile(_file, name);
        _news = opened ? std::string() : printable(opened.reason());
        if (!opened)
            continue;
        if (time)
            session().chooseTime(*time);
        return;
    }
}

void Browser::changeSection(int step) {
    const InspectedMessage* const message = session().message();
    if (!message)
        return;
    _part = BrowsePart::Display;
    const std::size_t row = displayRow(*message);
    std::optional<std::size_t> found;
    for (std::size_t i = 0; i < message->rows.size(); ++i)
        if (message->rows[i].isBranch && ((step > 0 && i > row && !found) || (step < 0 && i < row)))
            found = i;
    if (found)
        _displayPath = message->rows[*found].path;
}

} // namespace velmora

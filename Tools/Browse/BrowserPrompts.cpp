// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/MaskKey.h"
#include "Platform/PrintableText.h"
#include "Tools/Browse/BrowseTime.h"
#include "Tools/Browse/Browser.h"
#include "Tools/Browse/Screen/RowText.h"

#include <utility>

/// What the browser asks for.

namespace velmora {

void Browser::ask(std::string question, std::string text, std::function<void(const std::string&)> done) {
    _prompt.emplace(std::move(question), std::move(text), std::move(done));
}

void Browser::askFilter() {
    ask("Filter (condition or codes, empty for all): ", session().filter(), [this](const std::string& text) {
        if (const Result<Done> set = session().setFilter(text); !set)
            _news = printable(set.reason());
    });
}

void Browser::askTime() {
    ask("Go to (05:02:40, +90, -90 or a date): ", {}, [this](const std::string& text) {
        const InspectedMessage* const message = session().message();
        const std::optional<Time> first = session().file().index().first();
        if (text.empty() || !message || !first)
            return;
        const Result<Time> time = browsedTime(text, *first, message->message.time);
        if (time)
            session().chooseTime(*time);
        else
            _news = printable(time.reason());
    });
}

void Browser::askNote() {
    if (session().isEmpty())
        return;
    const auto& notes = session().notes();
    const auto note = notes.find(session().position());
    ask("Note (w writes it to a copy): ", note == notes.end() ? std::string() : note->second,
        [this](const std::string& text) { session().setNote(text); });
}

void Browser::askFile() {
    const auto range = session().marked();
    const std::string what =
        range ? std::to_string(range->second - range->first + 1) + " marked messages" : "all messages";
    ask("Write " + what + " to the new recording: ", {}, [this](const std::string& path) {
        if (path.empty())
            return;
        const Result<std::uint64_t> written = session().write(path);
        _news = written ? std::to_string(*written) + " messages written to " + printable(path)
                        : printable(written.reason());
    });
}

void Browser::search(SearchPass::Direction direction) {
    if (_query.empty())
        _news = "nothing to search for; / asks for it";
    else
        session().search(_query, direction);
}

void Browser::copy() {
    const InspectedMessage* const message = session().message();
    if (!message)
        return;
    std::string text;
    if (_part == BrowsePart::Display && message->rows.empty())
        return;
    if (_part == BrowsePart::Display) {
        const DisplayRow& row = message->rows.at(displayRow(*message));
        text = row.isBranch ? row.path : row.path + " = " + row.value;
    } else if (_part == BrowsePart::Content) {
        text = hexadecimalText(message->message.message.bytes());
    } else if (const std::vector<MessageRow> rows = session().rows(session().chosen(), 1); !rows.empty()) {
        text = rowText(rows.front());
        text.erase(0, text.find_first_not_of(" |"));
    }
    _host.copy(text);
    _news = "copied: " + text;
}

void Browser::quit() {
    bool hasNotes = false;
    for (const OpenedFile& file : _opened)
        for (const auto& [technology, each] : file.sessions)
            hasNotes = hasNotes || each->hasUnwrittenNotes();
    if (hasNotes && !std::exchange(_isLeaving, true))
        _news = "notes are not written: w writes them to a copy, q again leaves without them";
    else
        _host.quit();
}

} // namespace velmora

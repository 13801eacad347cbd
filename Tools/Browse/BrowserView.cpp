// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/DateText.h"
#include "Platform/PrintableText.h"
#include "Tools/Browse/BrowseHelp.h"
#include "Tools/Browse/Browser.h"
#include "Tools/Browse/Screen/BrowseLayout.h"
#include "Tools/Browse/Screen/RowText.h"

#include <algorithm>
#include <chrono>

/// What the browser's screen shows.

namespace velmora {

namespace {

/// The first of `all` rows so that the chosen one is among `shown`, in the middle where there are enough.
std::size_t firstAround(std::size_t chosen, std::size_t shown, std::size_t all) {
    if (all <= shown)
        return 0;
    return std::min(chosen > shown / 2 ? chosen - shown / 2 : 0, all - shown);
}

} // namespace

std::size_t Browser::displayRow(const InspectedMessage& message) const {
    const auto found = std::find_if(message.rows.begin(), message.rows.end(),
                                    [this](const DisplayRow& row) { return row.path == _displayPath; });
    if (found != message.rows.end())
        return static_cast<std::size_t>(found - message.rows.begin());
    // By default what the message has changed.
    const auto changed = std::find_if(message.rows.begin(), message.rows.end(),
                                      [](const DisplayRow& row) { return row.hasChanged || row.isReported; });
    return changed == message.rows.end() ? 0 : static_cast<std::size_t>(changed - message.rows.begin());
}

const ReportedField* Browser::chosenField(const InspectedMessage& message) const {
    const ReportedField* found = nullptr;
    for (const ReportedField& field : message.fields) {
        const bool isAtByte = field.place && field.place->has(_byte);
        // Where several fields share a byte, the row of the display that was chosen before counts.
        if (_part == BrowsePart::Content ? isAtByte && (!found || field.path == _displayPath)
                                         : field.path == message.rows[displayRow(message)].path)
            found = &field;
    }
    return found;
}

BrowseView Browser::view(ScreenSize size) {
    const BrowseLayout layout = BrowseLayout::of(size);
    BrowseSession& shown = session();
    BrowseView view;
    view.part = _part;
    view.title = printable(_files[_file]) + "  " + printable(shown.file().index().technology());
    if (const std::optional<MaskOptions> masking = shown.file().masking())
        view.title += "  masked: " + std::string(nameOf(masking->level));
    if (_files.size() > 1)
        view.title += "  file " + std::to_string(_file + 1) + " of " + std::to_string(_files.size());
    const std::uint64_t listed = shown.listed();
    view.place = listed == 0 ? "no messages "
                             : "message " + std::to_string(shown.chosen() + 1) + " of " +
                                   std::to_string(listed) + (shown.filter().empty() ? " " : " filtered ");
    const std::size_t first = firstAround(static_cast<std::size_t>(shown.chosen()), layout.listRows,
                                          static_cast<std::size_t>(listed));
    view.rows = shown.rows(first, layout.listRows);
    view.chosenRow = static_cast<std::size_t>(shown.chosen()) - first;
    const InspectedMessage* const message = shown.message();
    if (message && layout.lowerRows > 0) {
        view.display = message->rows;
        view.chosenDisplayRow = displayRow(*message);
        view.firstDisplayRow = firstAround(view.chosenDisplayRow, layout.lowerRows, view.display.size());
    }
    if (message) {
        showMessage(view);
        view.title += "  " +
                      dateAndTimeText(std::chrono::floor<std::chrono::seconds>(message->message.time), " ") +
                      " UTC";
    }
    showEvents(view, layout.lowerRows, size.columns);
    if (_showsHelp)
        view.help = browseHelp();
    view.isPrompt = _prompt.has_value();
    view.status = _prompt ? _prompt->line() : statusOf(message);
    return view;
}

void Browser::showMessage(BrowseView& view) {
    const InspectedMessage& message = *session().message();
    const Bytes bytes = message.message.message.bytes();
    view.bytes.assign(bytes.begin(), bytes.end());
    view.chosenByte = bytes.empty() ? 0 : std::min(_byte, bytes.size() - 1);
    if (!message.rows.empty())
        if (const ReportedField* const field = chosenField(message))
            view.field = field->place;
}

void Browser::showEvents(BrowseView& view, std::size_t rows, std::size_t columns) {
    const EventPass* const pass = session().events();
    view.eventsNews = pass && pass->isDone() ? "no events" : "not known yet";
    if (!pass)
        return;
    const std::vector<BrowsedEvent>& events = pass->events();
    const std::uint64_t position = session().position();
    // The latest that the chosen message has a part in, or that was before it.
    std::size_t chosen = 0;
    for (std::size_t i = 0; i < events.size(); ++i)
        if (events[i].position <= position)
            chosen = i;
    const std::size_t first = firstAround(chosen, rows, events.size());
    for (std::size_t i = first; i < events.size() && view.events.size() < rows; ++i)
        view.events.push_back(events[i]);
    view.chosenEvent = chosen - first;
    view.levels = pass->levels().means(2 * columns);
    for (const BrowsedEvent& event : events)
        if (event.severity != Severity::Info)
            view.eventPlaces.push_back(pass->levels().placeOf(event.time));
    if (const InspectedMessage* const message = session().message())
        view.place01 = pass->levels().placeOf(message->message.time);
}

std::string Browser::statusOf(const InspectedMessage* message) {
    if (!_news.empty())
        return " " + _news;
    std::string text;
    if (!message) {
        text = session().isEmpty() ? std::string() : "cannot be read any more";
    } else if (_part == BrowsePart::Messages || _part == BrowsePart::Events || message->rows.empty()) {
        text = std::to_string(message->message.message.size()) + " bytes, record " +
               std::to_string(message->message.number);
    } else if (const ReportedField* const field = chosenField(*message)) {
        text = fieldText(*field);
    } else if (_part == BrowsePart::Content) {
        text = "byte " + std::to_string(_byte) + ": no field that is shown";
    } else {
        const DisplayRow& row = message->rows[displayRow(*message)];
        text = row.path;
        if (!row.isBranch)
            text += row.latest ? ": reported at " + timeOfDay(*row.latest) : ": reported earlier, or never";
    }
    if (const std::string change = session().file().file().change(); !change.empty())
        text = "the file " + change + (text.empty() ? "" : "; " + text);
    if (const std::string progress = session().progress(); !progress.empty())
        text = progress + (text.empty() ? "" : "; " + text);
    return " " + text + (text.empty() ? "? shows the keys" : "");
}

} // namespace velmora

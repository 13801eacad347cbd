// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Watch/WatchView.h"

#include "Platform/PrintableText.h"
#include "Tools/Report.h"

#include <algorithm>
#include <chrono>
#include <utility>

#include <unistd.h>

namespace velmora {

void PipeView::showRefresh(const std::string& status, std::vector<TreeRow> rows) {
    std::string block = std::exchange(_begun, true) ? "\n" : "";
    block += status + "\n";
    for (const TreeRow& row : rows)
        block += row.text + "\n";
    _output.put(block);
    _output.flush();
}

void PipeView::showStatus(const std::string& status) {
    showRefresh(status, {});
}

void PipeView::showNote(const std::string& note, const std::string& advice) {
    if (!note.empty())
        report(advice.empty() ? note : note + "; " + advice);
}

ScreenView::ScreenView(std::function<void()> quit)
    : _quit(std::move(quit)),
      _deferredLog(::isatty(STDERR_FILENO) != 0 ? std::make_unique<DeferredLog>() : nullptr),
      _terminal(
          {[this](std::string_view bytes) { handleInput(bytes); }, [this] { draw(); }, [this] { _quit(); }}),
      _escape([this] { take(_keys.finish()); }) {}

void ScreenView::showRefresh(const std::string& status, std::vector<TreeRow> rows) {
    _status = status;
    _rows = std::move(rows);
    draw();
}

void ScreenView::showStatus(const std::string& status) {
    _status = status;
    draw();
}

void ScreenView::showNote(const std::string& note, const std::string& advice) {
    if (printable(note) == _note && advice == _advice)
        return;
    _note = printable(note);
    _advice = advice;
    if (!_status.empty()) // the first one comes once the first attempt to connect is over
        draw();
}

void ScreenView::showEvents(const std::string& line, bool rings) {
    constexpr std::string_view bell = "\a";
    if (rings)
        _terminal.draw(bell);
    if (line == _events)
        return;
    _events = line;
    if (!_status.empty())
        draw();
}

/// The rows, or the advice, a row for each window's width of it, with the note where the status line cuts
/// that.
std::vector<TreeRow> ScreenView::shownRows() const {
    if (!_rows.empty() || _advice.empty())
        return _filter.empty() ? _rows : rowsWith(_rows, _filter);
    const std::size_t columns = _terminal.size().columns;
    const bool isCut = displayWidth(_status + " " + _note) > columns;
    return adviceRows(isCut ? _note + "; " + _advice : _advice, columns);
}

void ScreenView::restoreTerminal() {
    _terminal.restore();
    if (_deferredLog)
        _deferredLog->release();
}

ScreenLayout ScreenView::layout() const {
    return layoutOf(shownRows(), withoutEvents(_terminal.size(), _events));
}

void ScreenView::handleInput(std::string_view bytes) {
    constexpr std::chrono::milliseconds escapeDelay{50};
    if (!take(_keys.take(bytes)))
        return;
    if (_keys.isWaiting())
        _escape.startOnce(escapeDelay);
    else
        _escape.stop();
}

/// False once the user has quit.
bool ScreenView::take(const std::vector<KeyPress>& presses) {
    for (const KeyPress& press : presses) {
        if (press.key == Key::Suspend) {
            _terminal.suspend();
        } else if (_prompt) {
            takeInPrompt(press);
        } else if (press.key == Key::Interrupt || press.text == "q") {
            _quit();
            return false;
        } else if (const Key key = scrollKey(press); key != Key::Character) {
            _scroll = scrolledBy(key, _scroll, layout());
        } else {
            takeLetter(press.text);
        }
    }
    if (!presses.empty())
        draw();
    return true;
}

void ScreenView::takeInPrompt(const KeyPress& press) {
    const Prompt::Outcome outcome = _prompt->take(press);
    if (outcome == Prompt::Outcome::GoesOn)
        return;
    const Prompt prompt = *std::exchange(_prompt, std::nullopt);
    if (outcome == Prompt::Outcome::Finished)
        prompt.finish();
}

void ScreenView::takeLetter(const std::string& letter) {
    if (letter == "/")
        _prompt.emplace("Search: ", std::string(), [this](const std::string& text) {
            if (!text.empty())
                _query = text;
            search(SearchDirection::Forward);
        });
    else if (letter == "f")
        _prompt.emplace("Only rows with (empty for all): ", _filter, [this](const std::string& text) {
            _filter = text;
            _scroll = 0;
        });
    else if (letter == "n")
        search(SearchDirection::Forward);
    else if (letter == "N")
        search(SearchDirection::Backward);
    else if (letter == "]")
        scrollTo(findBranch(shownRows(), _scroll, SearchDirection::Forward));
    else if (letter == "[")
        scrollTo(findBranch(shownRows(), _scroll, SearchDirection::Backward));
}

void ScreenView::search(SearchDirection direction) {
    if (!_query.empty())
        scrollTo(findRow(shownRows(), _query, _scroll, direction));
}

/// As far as it makes sense to scroll; a row that is on the last screen is shown there.
void ScreenView::scrollTo(const std::optional<std::size_t>& row) {
    if (row)
        _scroll = std::min(*row, layout().maximumScroll());
}

void ScreenView::draw() {
    if (_prompt) {
        _terminal.draw(composeFrame(shownRows(), _prompt->line(), _terminal.size(), _scroll, _events));
        return;
    }
    std::string status = _note.empty() ? _status : _status + " " + _note;
    if (!_rows.empty() && !_advice.empty())
        status += "; " + _advice;
    _terminal.draw(composeFrame(shownRows(), status, _terminal.size(), _scroll, _events));
}

} // namespace velmora

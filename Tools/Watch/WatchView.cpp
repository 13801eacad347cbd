// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Watch/WatchView.h"

#include "Platform/PrintableText.h"
#include "Tools/Report.h"

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
      _terminal({[this](std::string_view bytes) { handleInput(bytes); }, [this] { draw(); },
                 [this] { _quit(); }}) {}

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
        return _rows;
    const std::size_t columns = _terminal.size().columns;
    const bool isCut = displayWidth(_status + " " + _note) > columns;
    return adviceRows(isCut ? _note + "; " + _advice : _advice, columns);
}

void ScreenView::restoreTerminal() {
    _terminal.restore();
    if (_deferredLog)
        _deferredLog->release();
}

void ScreenView::handleInput(std::string_view bytes) {
    const std::size_t before = _scroll;
    for (const KeyPress& press : _keys.take(bytes)) {
        if (press.key == Key::Interrupt || press.text == "q") {
            _quit();
            return;
        }
        if (press.key == Key::Suspend)
            _terminal.suspend();
        _scroll = scrolledBy(scrollKey(press), _scroll,
                             layoutOf(shownRows(), withoutEvents(_terminal.size(), _events)));
    }
    if (_scroll != before)
        draw();
}

void ScreenView::draw() {
    std::string status = _note.empty() ? _status : _status + " " + _note;
    if (!_rows.empty() && !_advice.empty())
        status += "; " + _advice;
    _terminal.draw(composeFrame(shownRows(), status, _terminal.size(), _scroll, _events));
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/Recording/RecordingBar.h"

#include <algorithm>
#include <utility>

namespace velmora {

namespace {

constexpr double height = 52;
constexpr double buttonHeight = 44;
constexpr double margin = 12;
constexpr double gap = 4;

} // namespace

RecordingBar::RecordingBar(Actions actions) : _actions(std::move(actions)) {
    setAccessibleName("Recording");
    setFrame({0, 0, 0, height});
    _status.setFont(Font::systemFontOfSize(14));
    _field.setPlaceholder("Note about this moment");
    _field.setDelegate(this);
    _field.setHidden(true);
    _note.setAction([this] {
        if (_field.isHidden())
            askNote();
        else
            takeNote();
    });
    _stop.setAction([this] {
        const std::function<void()> stop = _actions.stop; // the call may destroy the bar
        stop();
    });
    for (View* const part : {static_cast<View*>(&_status), static_cast<View*>(&_field),
                             static_cast<View*>(&_note), static_cast<View*>(&_stop)})
        addSubview(*part);
}

void RecordingBar::setStatus(const std::string& status) {
    if (_status.text() != status)
        _status.setText(status);
}

void RecordingBar::askNote() {
    if (!_field.isHidden())
        return;
    _field.setText("");
    showField(true);
    (void)_field.becomeFirstResponder();
}

void RecordingBar::showField(bool isShown) {
    _field.setHidden(!isShown);
    _status.setHidden(isShown);
}

bool RecordingBar::textFieldShouldReturn(TextField&) {
    takeNote();
    return true;
}

void RecordingBar::takeNote() {
    const std::string text = _field.text();
    _field.resignFirstResponder();
    showField(false);
    if (text.find_first_not_of(' ') != std::string::npos)
        _actions.note(text);
}

void RecordingBar::layoutSubviews() {
    _note.sizeToFit();
    _stop.sizeToFit();
    const double top = (bounds().height - buttonHeight) / 2;
    const double stop = bounds().width - margin - _stop.frame().width;
    const double note = stop - gap - _note.frame().width;
    _stop.setFrame({stop, top, _stop.frame().width, buttonHeight});
    _note.setFrame({note, top, _note.frame().width, buttonHeight});
    const Rect text{margin, top, std::max(note - gap - margin, 0.0), buttonHeight};
    _status.setFrame(text);
    _field.setFrame(text);
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/DriveView/DriveButtons.h"

#include <algorithm>
#include <utility>

namespace velmora {

namespace {

constexpr double margin = 8;

} // namespace

DriveButtons::DriveButtons() {
    _record.setTogglable(true);
    _record.setAccessibleName("Record what is received");
    _bookmark.setAccessibleName("Bookmark this moment in the recording");
    _bookmark.setEnabled(false);
    _report.setAccessibleName("Report about the recording");
    for (Button* const each : {&_record, &_bookmark, &_report})
        addSubview(*each);
}

DriveButtons::~DriveButtons() = default;

void DriveButtons::setActions(Actions actions) {
    _actions = std::move(actions);
    _record.setAction([this] {
        _actions.record();
        update(); // which may have failed
    });
    _bookmark.setAction(_actions.bookmark);
    _report.setAction(_actions.report);
    update();
}

void DriveButtons::update() {
    const bool isRecording = _actions.isRecording && _actions.isRecording();
    _record.setOn(isRecording);
    _bookmark.setEnabled(isRecording);
}

void DriveButtons::layoutSubviews() {
    const double step = (bounds().width - 2 * margin) / 3;
    double x = margin;
    for (Button* const each : {&_record, &_bookmark, &_report}) {
        each->setFrame({x, 0, std::max(step - 4, 0.0), height});
        x += step;
    }
}

} // namespace velmora

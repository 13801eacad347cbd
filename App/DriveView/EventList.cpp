// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/DriveView/EventList.h"

namespace velmora {

namespace {

constexpr double margin = 8;
constexpr double buttonHeight = 40;

} // namespace

EventList::EventList(const DriveModel& model, const Clock& clock) : _model(&model), _clock(clock) {
    _grid.setColumns(eventColumns());
    _grid.setAccessibleName("Events");
    _grid.setPlaceholder("No event so far.");
    _grid.setOnChoose([this](std::size_t row) {
        if (_choose && row < _times.size())
            _choose(_times[row]);
    });
    for (const char* const title : {"Info", "Warnings", "Critical"}) {
        Button& button = *_filters.emplace_back(std::make_unique<Button>(title));
        button.setTogglable(true);
        button.setOn(true);
        button.setAction([this] { fill(); });
        addSubview(button);
    }
    addSubview(_grid);
}

EventList::~EventList() = default;

void EventList::setModel(const DriveModel& model) {
    _model = &model;
    _revision = model.eventsRevision();
    fill();
}

void EventList::update() {
    if (std::exchange(_revision, _model->eventsRevision()) != _model->eventsRevision())
        fill();
}

void EventList::fill() {
    SeverityFilter filter{};
    for (std::size_t i = 0; i < filter.size(); ++i)
        filter[i] = _filters[i]->isOn();
    EventRows made = eventRows(_model->events(), filter, _clock, mostRows);
    _times = std::move(made.times);
    _grid.setRows(std::move(made.rows));
}

double EventList::heightOfRows(std::size_t rows) const {
    return buttonHeight + margin + _grid.heightOfRows(rows);
}

void EventList::layoutSubviews() {
    const double width = bounds().width;
    const double step = (width - 2 * margin) / static_cast<double>(_filters.size());
    for (std::size_t i = 0; i < _filters.size(); ++i)
        _filters[i]->setFrame(
            {margin + static_cast<double>(i) * step, 0, std::max(step - 4, 0.0), buttonHeight});
    const double top = buttonHeight + margin;
    _grid.setFrame({0, top, width, std::max(bounds().height - top, 0.0)});
}

} // namespace velmora

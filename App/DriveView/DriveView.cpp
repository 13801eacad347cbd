// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/DriveView/DriveView.h"

#include "Analysis/Events/EventKind.h"
#include "App/DriveView/DriveText.h"
#include "App/DriveView/LabelText.h"
#include "App/DriveView/NeighbourRows.h"

#include <algorithm>
#include <cmath>
#include <utility>

namespace velmora {

namespace {

constexpr double margin = 12;
constexpr double headingSize = 15;
constexpr double gap = 6;
constexpr std::size_t neighbourRowsShown = 6;
constexpr std::size_t eventRowsShown = 5;

} // namespace

DriveView::DriveView(DriveSource& source, const Clock& clock)
    : _source(&source), _charts(source), _events(source.model(), clock), _clock(clock) {
    setAccessibleName("Drive");
    _neighbours.setAccessibleName("Neighbours");
    _neighbours.setPlaceholder("No neighbour cells have been reported.");
    _neighbours.setColumns(neighbourColumns({}));
    addSubview(_now);
    addSubview(_buttons);
    for (Label* each : {&_neighboursHeading, &_chartsHeading, &_eventsHeading})
        each->setFont(Font::boldSystemFontOfSize(headingSize));
    addSubview(_neighboursHeading);
    addSubview(_neighbours);
    addSubview(_chartsHeading);
    addSubview(_charts);
    addSubview(_eventsHeading);
    addSubview(_events);
    _events.setOnChoose([this](Time time) {
        _charts.showMoment(time);
        _source->choose(time);
        setContentOffset(_chartsHeading.frame().y);
    });
}

DriveView::~DriveView() = default;

void DriveView::setSource(DriveSource& source) {
    _source = &source;
    _charts.setSource(source);
    _events.setModel(source.model());
    update();
    updateEvents();
    updateCharts();
}

std::string DriveView::latestChange() const {
    const Time moment = _source->moment();
    for (const Event& each : _source->model().events()) {
        if (_source->isRecorded() && each.time > moment)
            continue;
        if (each.kind != rowOf(EventKind::Malformed).name) // which says nothing about the network
            return clockText(each.time, _clock) + ' ' + eventText(each);
    }
    return {};
}

void DriveView::update() {
    const DriveNow known = _source->now();
    const Time moment = _source->moment();
    const LevelClasses& classes = _source->model().classes();
    _now.show(known, classes, moment, _source->link(), latestChange());
    if (std::exchange(_columnsOf, known.technology) != known.technology)
        _neighbours.setColumns(neighbourColumns(known.technology));
    _neighbours.setRows(neighbourRows(_source->neighbours(), known, classes, moment));
    _buttons.update();
    _charts.updateMoment();
}

void DriveView::updateEvents() {
    _events.update();
}

void DriveView::updateCharts() {
    const std::string progress = _source->progress();
    changeText(_chartsHeading, progress.empty() ? "Over time" : "Over time, " + progress);
    _charts.update();
    if (std::exchange(_panels, _charts.chart().panelCount()) != _charts.chart().panelCount())
        layoutSubviews();
}

void DriveView::layoutSubviews() {
    const double width = contentWidth();
    const double heading = std::ceil(sizeOfText("X", _neighboursHeading.font()).height) + gap;
    double charts = _charts.wantedHeight(width);
    double events = _events.heightOfRows(eventRowsShown);
    const double above = _now.heightForWidth(width) + DriveButtons::height + gap + heading +
                         _neighbours.heightOfRows(neighbourRowsShown) + gap;
    const double needed = above + heading + charts + gap + heading + events;
    if (const double spare = bounds().height - needed; spare > 0) {
        charts += spare * 0.6;
        events += spare * 0.4;
    }
    setContentHeight(std::max(needed, bounds().height));
    double y = 0;
    const auto place = [&](View& view, double height, double side = 0) {
        view.setFrame({side, y, std::max(width - 2 * side, 0.0), height});
        y += height;
    };
    place(_now, _now.heightForWidth(width));
    place(_buttons, DriveButtons::height);
    y += gap;
    place(_neighboursHeading, heading, margin);
    place(_neighbours, _neighbours.heightOfRows(neighbourRowsShown));
    y += gap;
    place(_chartsHeading, heading, margin);
    place(_charts, charts);
    y += gap;
    place(_eventsHeading, heading, margin);
    place(_events, events);
}

} // namespace velmora

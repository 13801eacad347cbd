// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Charts/ChartView.h"

#include "Toolkit/Widgets/Charts/ChartWidget.h"

#include <utility>

namespace velmora {

ChartView::ChartView() : View(new ChartWidget), _chart(static_cast<ChartWidget*>(widget())) {}

ChartView::~ChartView() {
    _chart->onCursorMoved = nullptr;
    _chart->onRangeChanged = nullptr;
}

ChartView::PanelId ChartView::addPanel(ChartPanel panel) {
    const PanelId id = _chart->model.addPanel(std::move(panel));
    _chart->contentsChanged();
    return id;
}

void ChartView::setPanel(PanelId id, ChartPanel panel) {
    if (_chart->model.setPanel(id, std::move(panel)))
        _chart->contentsChanged();
}

void ChartView::removePanel(PanelId id) {
    if (_chart->model.removePanel(id))
        _chart->contentsChanged();
}

std::size_t ChartView::panelCount() const {
    return _chart->model.panels().size();
}

void ChartView::setBands(std::vector<ChartBand> bands) {
    if (bands == _chart->model.bands)
        return;
    _chart->model.bands = std::move(bands);
    _chart->contentsChanged();
}

void ChartView::setTicks(std::vector<ChartTick> ticks) {
    if (ticks == _chart->model.ticks)
        return;
    _chart->model.ticks = std::move(ticks);
    _chart->contentsChanged();
}

void ChartView::setNow(std::int64_t now_ns) {
    _chart->setNow(now_ns);
}

void ChartView::samplesChanged() {
    _chart->samplesChanged();
}

void ChartView::setSpan(std::optional<std::chrono::nanoseconds> span) {
    _chart->changeWindow([&span](TimeWindow& window) {
        window.setSpan(span ? std::optional<std::int64_t>(span->count()) : std::nullopt);
    });
}

std::optional<std::chrono::nanoseconds> ChartView::span() const {
    const auto span_ns = _chart->model.window.span_ns();
    return span_ns ? std::optional(std::chrono::nanoseconds(*span_ns)) : std::nullopt;
}

TimeRange ChartView::range() const {
    return _chart->model.range();
}

void ChartView::setRange(const TimeRange& range) {
    _chart->changeWindow([&range](TimeWindow& window) { window.setRange(range); });
}

bool ChartView::isFollowing() const {
    return _chart->model.window.isFollowing();
}

void ChartView::followNow() {
    _chart->changeWindow([](TimeWindow& window) { window.follow(); });
}

void ChartView::setCursor(std::optional<std::int64_t> time_ns) {
    _chart->setCursor(time_ns);
}

std::optional<std::int64_t> ChartView::cursor() const {
    return _chart->model.cursor_ns;
}

void ChartView::setOnCursorMoved(std::function<void(std::optional<std::int64_t>)> moved) {
    _chart->onCursorMoved = std::move(moved);
}

void ChartView::setOnRangeChanged(std::function<void()> changed) {
    _chart->onRangeChanged = std::move(changed);
}

std::vector<ChartReading> ChartView::readings() const {
    return _chart->model.readings(_chart->model.readingTime_ns());
}

std::string ChartView::summary() const {
    return _chart->model.summary();
}

ChartTable ChartView::table(std::size_t rowLimit) const {
    return _chart->model.table(rowLimit);
}

void ChartView::setShowsTable(bool shows) {
    _chart->setShowsTable(shows);
}

bool ChartView::showsTable() const {
    return _chart->showsTable();
}

void ChartView::sizeToFit() {
    setFrame({frame().x, frame().y, frame().width, _chart->preferredHeight()});
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/DriveView/DriveCharts.h"

#include <algorithm>
#include <array>
#include <utility>

namespace velmora {

namespace {

using namespace std::chrono_literals;

constexpr double margin = 8;
constexpr double buttonHeight = 40;

struct Span {
    const char* title;
    const char* name;
    std::optional<std::chrono::nanoseconds> span;
};
constexpr std::array<Span, 4> spans{{{"1 min", "One minute", 1min},
                                     {"5 min", "Five minutes", 5min},
                                     {"30 min", "Thirty minutes", 30min},
                                     {"All", "All that there is", std::nullopt}}};
constexpr std::size_t nowButton = spans.size();
constexpr std::size_t tableButton = nowButton + 1;

ChartSeverity toChart(Severity severity) {
    switch (severity) {
    case Severity::Info: return ChartSeverity::info;
    case Severity::Warning: return ChartSeverity::warning;
    case Severity::Critical: break;
    }
    return ChartSeverity::critical;
}

constexpr std::array<ChartLine, 4> lines{ChartLine::solid, ChartLine::dashed, ChartLine::dotted,
                                         ChartLine::dashDotted};

/// A key of what a panel shows beside its samples.
std::string keyOf(const ChartPanel& panel) {
    std::string key = panel.title + '|' + panel.unit + '|' + std::to_string(panel.decimals);
    for (const ChartSeries& each : panel.series)
        key += '|' + each.name + '@' + std::to_string(reinterpret_cast<std::uintptr_t>(each.samples.get()));
    for (const ChartLimit& each : panel.limits)
        key += '|' + each.label + std::to_string(each.value);
    return key;
}

} // namespace

DriveCharts::DriveCharts(DriveSource& source) : _source(&source) {
    _chart.setAccessibleName("Over time");
    addSubview(_chart);
    const auto add = [this](const char* title, const char* name, std::function<void()> action) {
        Button& button = *_buttons.emplace_back(std::make_unique<Button>(title));
        button.setTogglable(true);
        button.setAccessibleName(name);
        button.setAction(std::move(action));
        addSubview(button);
    };
    for (const Span& each : spans)
        add(each.title, each.name, [this, span = each.span] { chooseSpan(span); });
    add("Now", "Follow now", [this] { chooseNow(); });
    add("Table", "Show as a table", [this] { _chart.setShowsTable(_buttons[tableButton]->isOn()); });
    _chart.setOnRangeChanged([this] { markSpan(); });
    _chart.setOnCursorMoved([this](std::optional<std::int64_t> time_ns) {
        if (time_ns)
            _source->choose(Time(std::chrono::nanoseconds(*time_ns)));
    });
    setSource(source);
}

void DriveCharts::setSource(DriveSource& source) {
    _source = &source;
    _chart.setCursor({});
    if (source.isRecorded())
        _chart.setSpan(std::nullopt);
    else
        _chart.setSpan(5min);
    updatePanels();
    _eventsRevision = source.model().eventsRevision() + 1; // whichever it had
    _bandsRevision = source.history().bandsRevision() + 1;
    update();
    updateMoment();
    markSpan();
}

void DriveCharts::chooseSpan(std::optional<std::chrono::nanoseconds> span) {
    const std::optional<std::int64_t> cursor_ns = _chart.cursor();
    if (_source->isRecorded() && span && cursor_ns)
        _chart.setRange({*cursor_ns - span->count() / 2, *cursor_ns + span->count() / 2});
    else
        _chart.setSpan(span);
    markSpan();
}

void DriveCharts::chooseNow() {
    if (_source->isRecorded())
        _source->choose(_source->end());
    else
        _chart.followNow();
    markSpan();
}

DriveCharts::~DriveCharts() {
    _chart.setOnRangeChanged({});
    _chart.setOnCursorMoved({});
}

void DriveCharts::markSpan() {
    // A recording's range does not follow its end, unless it is the whole one.
    const bool isPart = _source->isRecorded() && !_chart.isFollowing();
    for (std::size_t i = 0; i < spans.size(); ++i)
        _buttons[i]->setOn(isPart ? spans[i].span && _chart.range().length_ns() == spans[i].span->count()
                                  : _chart.span() == spans[i].span);
    _buttons[nowButton]->setOn(_source->isRecorded() ? _source->moment() >= _source->end()
                                                     : _chart.isFollowing());
}

void DriveCharts::update() {
    updatePanels();
    updateTicks();
    const DriveHistory& history = _source->history();
    if (std::exchange(_bandsRevision, history.bandsRevision()) != history.bandsRevision())
        _chart.setBands(history.bands());
    if (std::exchange(_messages, _source->revision()) != _source->revision())
        _chart.samplesChanged();
    _chart.setNow(nanosecondsOf(_source->end()));
    _buttons[tableButton]->setOn(_chart.showsTable());
}

void DriveCharts::updateMoment() {
    if (!_source->isRecorded())
        return;
    _chart.setCursor(nanosecondsOf(_source->moment()));
    markSpan();
}

void DriveCharts::showMoment(Time time) {
    _chart.setCursor(nanosecondsOf(time));
    markSpan();
}

ChartPanel DriveCharts::rolePanel(const char* title, const char* unit, Role role, std::size_t first) const {
    ChartPanel panel;
    panel.title = title;
    panel.unit = unit;
    const std::vector<DriveSeries> all = _source->model().series();
    for (std::size_t i = 0; i <= chartedNeighbours; ++i) {
        panel.series.push_back({all[first + i].name, _source->history().ring(first + i),
                                static_cast<ChartColor>(i), lines[i], false});
        panel.decimals = std::max(panel.decimals, _source->history().decimals(first + i));
    }
    if (const LevelLimits* const limits = _source->model().classes().limits(_source->now().technology, role))
        panel.limits = {{limits->fair, "fair"}, {limits->good, "good"}, {limits->excellent, "excellent"}};
    return panel;
}

ChartPanel DriveCharts::pinnedPanel(const DriveSeries& series, std::size_t number) const {
    ChartPanel panel;
    panel.title = series.name;
    panel.unit = nameOf(series.unit);
    panel.decimals = _source->history().decimals(number);
    panel.series.push_back({series.name.substr(series.name.rfind('/') + 1), _source->history().ring(number),
                            ChartColor::first, ChartLine::solid, true});
    return panel;
}

void DriveCharts::updatePanels() {
    const std::vector<DriveSeries> all = _source->model().series();
    updatePanel(0, rolePanel("Level", "dBm", Role::ServingLevel, servingLevelSeries));
    updatePanel(1, rolePanel("Quality", "dB", Role::ServingQuality, servingQualitySeries));
    std::size_t index = 2;
    for (std::size_t i = firstPinnedSeries; i < all.size(); ++i)
        updatePanel(index++, pinnedPanel(all[i], i));
    for (; _panels.size() > index; _panels.pop_back())
        _chart.removePanel(_panels.back().id);
}

void DriveCharts::updatePanel(std::size_t index, ChartPanel panel) {
    std::string key = keyOf(panel);
    if (index >= _panels.size())
        _panels.push_back({std::move(key), _chart.addPanel(std::move(panel))});
    else if (std::exchange(_panels[index].key, key) != key)
        _chart.setPanel(_panels[index].id, std::move(panel));
}

void DriveCharts::updateTicks() {
    const DriveModel& model = _source->model();
    if (std::exchange(_eventsRevision, model.eventsRevision()) == model.eventsRevision())
        return;
    std::vector<ChartTick> ticks;
    for (auto each = model.events().rbegin(); each != model.events().rend(); ++each)
        ticks.push_back({nanosecondsOf(each->time), toChart(each->severity),
                         each->text.empty() ? each->kind : each->text});
    _chart.setTicks(std::move(ticks));
}

double DriveCharts::wantedHeight(double width) {
    const Rect before = _chart.frame();
    _chart.setFrame({before.x, before.y, width, before.height});
    _chart.sizeToFit();
    const double height = _chart.frame().height;
    _chart.setFrame(before);
    return height + buttonHeight + margin;
}

void DriveCharts::layoutSubviews() {
    const double width = bounds().width;
    const double step = (width - 2 * margin) / static_cast<double>(_buttons.size());
    for (std::size_t i = 0; i < _buttons.size(); ++i)
        _buttons[i]->setFrame(
            {margin + static_cast<double>(i) * step, 0, std::max(step - 4, 0.0), buttonHeight});
    const double top = buttonHeight + margin;
    _chart.setFrame({0, top, width, std::max(bounds().height - top, 0.0)});
}

} // namespace velmora

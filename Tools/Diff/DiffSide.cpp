// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Diff/DiffSide.h"

#include "Tools/Analysed/AnalysedFiles.h"
#include "Tools/Decode/Paths/PathCheck.h"
#include "Tools/Stats/StatsAnalysis.h"
#include "Tools/Stats/StatsOptions.h"

#include <optional>

namespace velmora {

namespace {

const TimeRange allTimes;

/// Keeps the display as it is at a time: after the last message before it or at it.
class DisplayAnalysis final : public MessageAnalysis {
public:
    DisplayAnalysis(ObservedDisplay& display, std::optional<TimeBound> time, const AnalysisFeed& feed,
                    bool& isDone)
        : _display(display), _time(time), _feed(feed), _isDone(isDone) {}

    void report(const MessageReport& report) override {
        if (_time && report.time > TimeRange::momentOf(*_time, _feed.first().value_or(report.time)))
            _isDone = true;
        else
            _display.update(report.observed);
    }

private:
    ObservedDisplay& _display;
    std::optional<TimeBound> _time;
    const AnalysisFeed& _feed;
    bool& _isDone;
};

} // namespace

DiffSide::DiffSide(const DiffInput& input, const DiffOptions& options, What what)
    : _input(input), _options(options), _what(what),
      _groups({StatisticsPlan::By::Nothing, leafChoice(options.selection, options.roles)},
              [](const GroupStatistics&) {}),
      _feed(options.clock, [this](const Catalogue& catalogue) { return makeAnalysis(catalogue); }) {}

std::unique_ptr<MessageAnalysis> DiffSide::makeAnalysis(const Catalogue& catalogue) {
    if (_what == What::Statistics)
        return std::make_unique<StatsAnalysis>(catalogue, _groups, allTimes, _feed);
    _displays.push_back(std::make_unique<Display>(Display{catalogue.technology(), {}}));
    return std::make_unique<DisplayAnalysis>(_displays.back()->values, _input.time, _feed, _isDone);
}

bool DiffSide::read(DecoderLines& lines) {
    AnalysedInput input;
    input.files = {_input.file};
    input.technology = _options.technology;
    input.isDone = [this] { return _isDone; };
    const bool good = analyseFiles(input, _feed, lines);
    _feed.finish();
    return good;
}

const GroupStatistics& DiffSide::statistics() const {
    return _groups.groups().empty() ? _none : *_groups.groups().front();
}

} // namespace velmora

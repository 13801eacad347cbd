// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Benchmarks/DriveReader.h"
#include "Export/Columns/InputColumns.h"
#include "Platform/Console.h"
#include "Platform/Linux/Files/FileResources.h"
#include "Tools/Columns/ColumnsObserver.h"
#include "Tools/Decode/DecodeWriter.h"
#include "Tools/Events/EventAnalysis.h"
#include "Tools/Report.h"
#include "Tools/Rules/RuleFiles.h"
#include "Tools/Stats/StatsAnalysis.h"

#include <benchmark/benchmark.h>

#include <cstdlib>
#include <deque>

// What a drive costs that is analysed: its events, its statistics and its columns, by technology. Items are
// messages.

namespace velmora {
namespace {

constexpr std::size_t count = 20'000;

/// The resources of this program's own, and a drive.
class Setting {
    FileResources _files;

public:
    explicit Setting(benchmark::State& state)
        : kind(scenarioKinds()[static_cast<std::size_t>(state.range(0))]) {
        redirectConsole(stderr);
        setResources(&_files);
        state.SetLabel(std::string(kind.name));
    }
    ~Setting() { setResources(nullptr); }
    Setting(const Setting&) = delete;
    Setting& operator=(const Setting&) = delete;

    const ScenarioKind& kind;
    DriveReader reader{kind, count};
};

/// Passes the drive to a new analysis.
void analyse(const DriveReader& reader, AnalysisFeed& feed) {
    const Result<TechnologyFeed*> technology = feed.of(reader.technology());
    if (!technology)
        std::abort();
    for (const LoggedMessage& message : reader.messages())
        benchmark::DoNotOptimize((*technology)->decode(message, 0));
    feed.finish();
}

class CountingSink final : public EventSink {
public:
    void happened(const Event&) override { ++events; }
    std::size_t events = 0;
};

void eventsOfADrive(benchmark::State& state) {
    const Setting setting(state);
    const AllCatalogues catalogues;
    std::vector<RulePath> paths = standardRulePaths();
    std::erase_if(paths, [](const RulePath& path) { return !path.isBuiltIn; });
    const RuleSet rules = readRules(catalogues, paths);
    CountingSink sink;
    for (auto step : state) {
        AnalysisFeed feed(AnalysisClock::Arrival, [&](const Catalogue& catalogue) {
            auto analysis = std::make_unique<EventAnalysis>(catalogue, sink);
            analysis->add(makeRuleDetector(rules, catalogue));
            return analysis;
        });
        analyse(setting.reader, feed);
    }
    benchmark::DoNotOptimize(sink.events);
    state.SetItemsProcessed(state.iterations() * static_cast<std::int64_t>(count));
}

void statisticsOfADrive(benchmark::State& state) {
    const Setting setting(state);
    for (auto step : state) {
        StatisticsGroups groups(
            {}, [](const GroupStatistics& group) { benchmark::DoNotOptimize(group.parts.size()); });
        std::optional<AnalysisFeed> feed;
        const TimeRange everything;
        feed.emplace(AnalysisClock::Arrival, [&](const Catalogue& catalogue) {
            return std::make_unique<StatsAnalysis>(catalogue, groups, everything, *feed);
        });
        analyse(setting.reader, *feed);
        groups.finish();
    }
    state.SetItemsProcessed(state.iterations() * static_cast<std::int64_t>(count));
}

/// Files that are written to nowhere.
class NoOutputs final : public TableOutputs, private ByteSink {
public:
    ByteSink& open(std::string_view, std::string_view) override { return *this; }

private:
    Result<Done> write(Bytes) override { return Done(); }
};

void columnsOfADrive(benchmark::State& state) {
    Setting setting(state);
    const AllCatalogues catalogues;
    const RuleSet rules = loadBuiltInRules(catalogues);
    WorkContext context("drive");
    for (auto step : state) {
        NoOutputs outputs;
        InputColumns columns({}, rules, outputs);
        ColumnsObserver observer(columns, setting.reader, nullptr);
        setting.reader.rewind();
        if (!decodeMessages(setting.reader, {}, context, observer) || !columns.finish({}))
            std::abort();
    }
    state.SetItemsProcessed(state.iterations() * static_cast<std::int64_t>(count));
}

BENCHMARK(eventsOfADrive)->DenseRange(0, 5)->Unit(benchmark::kMillisecond);
BENCHMARK(statisticsOfADrive)->DenseRange(0, 5)->Unit(benchmark::kMillisecond);
BENCHMARK(columnsOfADrive)->DenseRange(0, 5)->Unit(benchmark::kMillisecond);

} // namespace
} // namespace velmora

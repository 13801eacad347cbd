// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Application.h"
#include "Toolkit/Charts/ChartView.h"
#include "Toolkit/Charts/SampleColumns.h"
#include "Toolkit/Charts/SampleStore.h"

#include <QCoreApplication>
#include <QWidget>

#include <cmath>
#include <cstdint>
#include <memory>
#include <vector>

#include <benchmark/benchmark.h>

// What charts cost, drawn in software: a frame while the user pans over a million samples (at most 8 ms), an
// appended sample, and a day of twenty series in memory.
//
//   QT_QPA_PLATFORM=offscreen bench-charts

namespace velmora {
namespace {

constexpr std::int64_t second_ns = 1'000'000'000;
constexpr std::int64_t count = 1'000'000;
constexpr std::int64_t step_ns = second_ns / 10;
constexpr std::int64_t end_ns = count * step_ns;

/// A level as it is measured: slow changes and noise, in quarters of a dB.
double levelAt(std::int64_t number) {
    const auto noise =
        static_cast<double>((static_cast<std::uint64_t>(number) * 2654435761U >> 7U) % 24U) / 4;
    return -110 + 25 * std::sin(static_cast<double>(number) / 3000) + noise;
}

void fill(SampleRing& ring) {
    for (std::int64_t number = 0; number < count; ++number)
        if (!ring.append(number * step_ns, std::round(levelAt(number) * 4) / 4))
            std::abort();
}

/// Pans by a pixel a frame over a range with that many of the samples.
void panFrame(benchmark::State& state) {
    SampleStore store;
    const auto ring = store.makeSeries(5 * second_ns);
    fill(*ring);
    ChartView chart;
    ChartPanel panel;
    panel.title = "Level";
    panel.unit = "dBm";
    panel.series.push_back({"Serving", ring, ChartColor::first, ChartLine::solid, false});
    chart.addPanel(panel);
    chart.setNow(end_ns);
    chart.setFrame({0, 0, 1280, 400});
    chart.widget()->show();
    QCoreApplication::processEvents();
    const std::int64_t length_ns = state.range(0) * step_ns;
    std::int64_t begin_ns = (end_ns - length_ns) / 2;
    for (auto iteration : state) {
        begin_ns += length_ns / 1280;
        chart.setRange({begin_ns, begin_ns + length_ns});
        chart.widget()->repaint();
    }
}
BENCHMARK(panFrame)->Arg(600)->Arg(10'000)->Arg(1'000'000)->Unit(benchmark::kMillisecond);

void reduceMillion(benchmark::State& state) {
    SampleStore store;
    const auto ring = store.makeSeries(5 * second_ns);
    fill(*ring);
    std::vector<SampleColumn> columns;
    for (auto iteration : state) {
        reduceToColumns(*ring, 0, end_ns / 1000, 1000, columns);
        benchmark::DoNotOptimize(columns.data());
    }
}
BENCHMARK(reduceMillion)->Unit(benchmark::kMicrosecond);

void appendSample(benchmark::State& state) {
    SampleStore store;
    const auto ring = store.makeSeries(5 * second_ns);
    std::int64_t time_ns = 0;
    for (auto iteration : state) {
        time_ns += second_ns;
        benchmark::DoNotOptimize(ring->append(time_ns, -90));
    }
    state.SetItemsProcessed(state.iterations());
}
BENCHMARK(appendSample);

void dayOfTwentySeries(benchmark::State& state) {
    for (auto iteration : state) {
        SampleStore store;
        std::vector<std::shared_ptr<SampleRing>> series;
        for (int number = 0; number < 20; ++number)
            series.push_back(store.makeSeries(5 * second_ns));
        for (std::int64_t second = 0; second < 24 * 3600; ++second)
            for (const auto& ring : series)
                if (!ring->append(second * second_ns, -90))
                    std::abort();
        state.counters["MiB"] = static_cast<double>(store.byteCount()) / (1 << 20);
    }
}
BENCHMARK(dayOfTwentySeries)->Unit(benchmark::kMillisecond);

} // namespace
} // namespace velmora

int main(int argc, char** argv) {
    qputenv("QT_QPA_PLATFORM", "offscreen");
    benchmark::Initialize(&argc, argv);
    const velmora::Application application(argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}

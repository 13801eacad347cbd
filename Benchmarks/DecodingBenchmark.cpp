// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/Ostrel_GSMLogGenerator.h"
#include "Model/VelmoraModelNode.h"
#include "Platform/Console.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Support/Hex.h"

#include <benchmark/benchmark.h>

#include <cstdio>

// What one log message costs on its way to the display, and what a redraw costs: framing and routing alone,
// one section's update alone, and the display tree. Every figure is for one operation.

namespace velmora {
namespace {

DictionaryRef dictionary(std::initializer_list<Dictionary::Entry> entries) {
    return std::make_shared<Dictionary>(entries);
}

/// A decoder with its display built, and no log that would be written.
class Decoder {
public:
    Decoder() {
        redirectConsole(stderr);
        _resources.put("Ostrel_GSM", "plist",
                       Value(dictionary({{"Serving PLMN", makeDictionary()},
                                         {"Process CS", makeDictionary()},
                                         {"Process PS", makeDictionary()},
                                         {"Process CO", makeDictionary()},
                                         {"Equivalent PLMN List", makeArray()}})));
        static_cast<void>(generator.getDisplayFromState(state));
    }

private:
    FakeClock _clock;
    FakeResources _resources;

public:
    Ostrel_GSMLogGenerator generator{_clock};
    Dictionary state;
};

void framingAndRouting(benchmark::State& state) {
    Decoder decoder;
    const Data message = record(0x1234, "00 01 02 03"); // a code without subscriber
    for (auto step : state)
        decoder.generator.updateWithData(message);
    state.SetItemsProcessed(state.iterations());
}
BENCHMARK(framingAndRouting);

void routingToFourSections(benchmark::State& state) {
    Decoder decoder;
    const Data message = record(0x7132, "01 00 00"); // registration: four sections subscribe
    for (auto step : state)
        decoder.generator.updateWithData(message);
    state.SetItemsProcessed(state.iterations());
}
BENCHMARK(routingToFourSections);

void sectionUpdate(benchmark::State& state) {
    Decoder decoder;
    Base& section = *decoder.generator.classIndex().getClass("Serving PLMN");
    const Data message = record(0x7135, "00 03 62 F0 01 12 34 56 00 00 00 00 00 00 00 00 00 00 00");
    for (auto step : state)
        section.updateWithData(message, 0x7135); // six fields
    state.SetItemsProcessed(state.iterations());
}
BENCHMARK(sectionUpdate);

/// A display of `sections` dictionaries of ten values each, and as many lists of four rows of five values.
Value displayOf(int sections) {
    const DictionaryRef display = makeDictionary();
    for (int i = 0; i < sections; ++i) {
        const DictionaryRef values = makeDictionary();
        for (int j = 0; j < 10; ++j)
            values->set("Value " + std::to_string(j), "some text of usual length");
        display->set("Section " + std::to_string(i), values);
        const ArrayRef rows = makeArray();
        for (int j = 0; j < 4; ++j) {
            const DictionaryRef row = makeDictionary();
            for (int k = 0; k < 5; ++k)
                row->set("Column " + std::to_string(k), "-80 dBm");
            rows->append(row);
        }
        display->set("List " + std::to_string(i), rows);
    }
    return display;
}

void treeBuilding(benchmark::State& state) {
    const Value display = displayOf(static_cast<int>(state.range(0)));
    std::size_t nodes = 0;
    for (auto step : state) {
        PathDictionary paths;
        benchmark::DoNotOptimize(VelmoraModelNode::makeTreeFromObject(display, paths));
        nodes = paths.size();
    }
    state.counters["nodes"] = static_cast<double>(nodes);
    state.SetItemsProcessed(state.iterations() * static_cast<std::int64_t>(nodes));
}
BENCHMARK(treeBuilding)->Arg(1)->Arg(26);

void historyCopy(benchmark::State& state) {
    const Value display = displayOf(26);
    for (auto step : state)
        benchmark::DoNotOptimize(display.copy());
}
BENCHMARK(historyCopy);

} // namespace
} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Benchmarks/DriveReader.h"
#include "Platform/Console.h"
#include "Platform/Linux/Files/FileResources.h"
#include "Tools/Decode/DecodeWriter.h"
#include "Tools/Decode/Samples/SampleColumns.h"
#include "Tools/Output.h"
#include "Tools/Report.h"
#include "Tools/Text/JSONText.h"
#include "Tools/Text/TimeText.h"

#include <benchmark/benchmark.h>

#include <cstdlib>

#include <fcntl.h>
#include <unistd.h>

// What `velmora-log decode` costs a message beyond decoding it: the text of a section and of a time, and
// complete drives in their formats, written to nowhere. Bytes are those of the text, items are messages.

namespace velmora {
namespace {

/// A section of six values, as most are.
Value section() {
    return std::make_shared<Dictionary>(std::initializer_list<Dictionary::Entry>{
        {"PLMN Sel Mod", "Automatic"},
        {"Mobile Country Code", "001"},
        {"Mobile Network Code", "01"},
        {"Location Area Code", "4101"},
        {"Routing Area Code", "1"},
        {"Service Type", "CS_PS_SERVICE"},
    });
}

void jsonOfASection(benchmark::State& state) {
    const Value node = section();
    TextBuffer out;
    for (auto step : state) {
        out.clear();
        appendJson(out, node);
        benchmark::DoNotOptimize(out.view().data());
        benchmark::ClobberMemory();
    }
    state.SetBytesProcessed(state.iterations() * static_cast<std::int64_t>(out.size()));
}
BENCHMARK(jsonOfASection);

void textOfATime(benchmark::State& state) {
    TextBuffer out;
    TimeText text;
    Time moment{};
    for (auto step : state) {
        out.clear();
        text.append(out, moment);
        moment += std::chrono::milliseconds(37);
        benchmark::DoNotOptimize(out.view().data());
        benchmark::ClobberMemory();
    }
    state.SetBytesProcessed(state.iterations() * static_cast<std::int64_t>(out.size()));
}
BENCHMARK(textOfATime);

enum Printed : std::int64_t { TheEnd, EveryRefresh, EveryMessage, SampleObjects, SampleCells };

/// The scenario's place in the registry, and what is printed.
void decodeDrive(benchmark::State& state) {
    constexpr std::size_t count = 20'000;
    const ScenarioKind& kind = scenarioKinds()[static_cast<std::size_t>(state.range(0))];
    DecodeOptions options;
    options.files = {"drive"};
    if (state.range(1) == TheEnd)
        options.format = DecodeOptions::Format::Json;
    else if (state.range(1) == SampleCells)
        options.format = DecodeOptions::Format::Csv;
    else
        options.format = DecodeOptions::Format::JsonLines;
    if (state.range(1) == SampleObjects || state.range(1) == SampleCells)
        options.samples = DecodeOptions::Samples::Long;
    if (state.range(1) == EveryMessage)
        options.every = DecodeOptions::Every::Message;
    constexpr const char* names[] = {"in the end", "every refresh", "every message", "samples, jsonl",
                                     "samples, csv"};
    state.SetLabel(std::string(kind.name) + ", " + names[state.range(1)]);

    redirectConsole(stderr);
    FileResources files;
    setResources(&files);
    const int nowhere = ::open("/dev/null", O_WRONLY | O_CLOEXEC);
    {
        Output output(nowhere);
        WorkContext context("drive");
        DriveReader reader(kind, count);
        SampleColumns columns; // of wide tables alone
        for (auto step : state) {
            reader.rewind();
            const std::unique_ptr<DecodeWriter> writer =
                DecodeWriter::make(options, 0, false, columns, output);
            const Result<DecodedFile> decoded = decodeMessages(reader, {}, context, *writer);
            if (!decoded)
                std::abort();
            writer->finish(decoded->technologies.front());
        }
    }
    setResources(nullptr);
    ::close(nowhere);
    state.SetItemsProcessed(state.iterations() * static_cast<std::int64_t>(count));
}
BENCHMARK(decodeDrive)
    ->ArgsProduct({{0, 1, 2, 3, 4}, {TheEnd, EveryRefresh, EveryMessage, SampleObjects, SampleCells}})
    ->Unit(benchmark::kMillisecond);

} // namespace
} // namespace velmora

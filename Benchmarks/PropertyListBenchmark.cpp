// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// How long the property lists take that arrive with log messages: the SIM files and the cell information.

#include "PropertyLists/PropertyList.h"

#include <benchmark/benchmark.h>

#include <cstdio>
#include <cstdlib>
#include <string>
#include <utility>
#include <vector>

namespace velmora {
namespace {

using Buffer = std::vector<std::uint8_t>;

/// The SIM's files: 14 strings.
Value simFiles() {
    const auto files = makeDictionary();
    for (const char* name : {"ICCID", "IMSI", "SPN", "EHPLMN", "FPLMN", "HPLMN", "OPLMN", "PLMN", "RPLMN",
                             "LOCI", "PSLOCI", "EPSLOCI", "AD", "ACC"})
        files->set(name, std::string(name) + " 2620109876543210 26201 26202");
    return files;
}

/// The cells that a phone hears: 16 of them with 10 keys each.
Value cells() {
    const auto list = makeArray();
    for (int cell = 0; cell < 16; ++cell) {
        const auto dictionary = makeDictionary();
        dictionary->set("kVoxCellMonitorCellRadioAccessTechnology",
                        "kVoxCellMonitorRadioAccessTechnologyLTE");
        dictionary->set("kVoxCellMonitorCellType",
                        cell == 0 ? "kVoxCellMonitorCellTypeServing" : "kVoxCellMonitorCellTypeNeighbor");
        for (const char* key : {"MCC", "MNC", "TAC", "CellId", "UARFCN", "PID", "RSSI", "BandInfo"})
            dictionary->set(std::string("kVoxCellMonitor") + key, 262 + 1000 * cell);
        list->append(dictionary);
    }
    return list;
}

[[noreturn]] void stop(const std::string& reason) {
    std::fprintf(stderr, "%s\n", reason.c_str());
    std::exit(1);
}

Buffer xmlOf(const Value& value) {
    const auto xml = writeXMLPropertyList(value);
    if (!xml)
        stop(xml.reason());
    return Buffer(xml->begin(), xml->end());
}

Buffer binaryOf(const Value& value) {
    auto binary = writeBinaryPropertyList(value);
    if (!binary)
        stop(binary.reason());
    return std::move(*binary);
}

void read(benchmark::State& state, const Buffer& list) {
    for (auto _ : state) {
        auto value = readPropertyList(list);
        if (!value)
            stop(value.reason());
        benchmark::DoNotOptimize(value);
    }
    state.SetBytesProcessed(state.iterations() * static_cast<std::int64_t>(list.size()));
}

void write(benchmark::State& state, const Value& value, Buffer (*writer)(const Value&)) {
    std::size_t size = 0;
    for (auto _ : state) {
        auto list = writer(value);
        size = list.size();
        benchmark::DoNotOptimize(list);
    }
    state.SetBytesProcessed(state.iterations() * static_cast<std::int64_t>(size));
}

BENCHMARK_CAPTURE(read, SIMFilesXML, xmlOf(simFiles()));
BENCHMARK_CAPTURE(read, SIMFilesBinary, binaryOf(simFiles()));
BENCHMARK_CAPTURE(read, CellsXML, xmlOf(cells()));
BENCHMARK_CAPTURE(read, CellsBinary, binaryOf(cells()));
BENCHMARK_CAPTURE(write, SIMFilesXML, simFiles(), xmlOf);
BENCHMARK_CAPTURE(write, SIMFilesBinary, simFiles(), binaryOf);
BENCHMARK_CAPTURE(write, CellsXML, cells(), xmlOf);
BENCHMARK_CAPTURE(write, CellsBinary, cells(), binaryOf);

} // namespace
} // namespace velmora

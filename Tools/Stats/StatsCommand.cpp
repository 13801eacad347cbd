// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Stats/StatsCommand.h"

#include "Tools/Analysed/AnalysedFiles.h"
#include "Tools/Decode/Paths/FileTechnologies.h"
#include "Tools/Decode/Paths/KnownCatalogues.h"
#include "Tools/Decode/Paths/PathCheck.h"
#include "Tools/ExitStatus.h"
#include "Tools/Output.h"
#include "Tools/Report.h"
#include "Tools/Stats/StatsAnalysis.h"
#include "Tools/Stats/StatsCSV.h"
#include "Tools/Stats/StatsJSON.h"
#include "Tools/Stats/StatsText.h"

#include <memory>
#include <optional>

#include <unistd.h>

namespace velmora {

namespace {

std::unique_ptr<StatsWriter> makeWriter(const StatsOptions& options, Output& output) {
    switch (options.format) {
    case StatsOptions::Format::Json: return std::make_unique<StatsJSON>(output, options);
    case StatsOptions::Format::Csv: return std::make_unique<StatsCSV>(output, options);
    case StatsOptions::Format::Text: break;
    }
    return std::make_unique<StatsText>(output, options);
}

/// Reads the files and writes their statistics. Returns whether all of them was read.
bool writeStatistics(const StatsOptions& options, bool checksPaths, DecoderLines& lines, Output& output) {
    const std::unique_ptr<StatsWriter> writer = makeWriter(options, output);
    writer->begin();
    bool hasGroups = false;
    const PositionedReader* positions = nullptr;
    const auto square = [&]() -> std::optional<Square> {
        if (!positions || !positions->position())
            return std::nullopt;
        const Fix& fix = positions->position()->fix;
        return Square::of({fix.latitude, fix.longitude}, options.squareSize_m);
    };
    StatisticsGroups groups({options.by, leafChoice(options.selection, options.roles), square},
                            [&](const GroupStatistics& group) {
                                hasGroups = true;
                                writer->write(group);
                            });
    std::optional<AnalysisFeed> feed;
    feed.emplace(options.clock, [&](const Catalogue& catalogue) {
        if (checksPaths)
            if (const auto problem = impossiblePath(options.selection, {&catalogue}))
                throw ImpossiblePath(*problem);
        return std::make_unique<StatsAnalysis>(catalogue, groups, options.range, *feed);
    });
    AnalysedInput input;
    input.files = options.files;
    input.technology = options.technology;
    input.writesAsItGoes = options.by == StatisticsPlan::By::Minute;
    if (options.by == StatisticsPlan::By::Square)
        input.positions = [&positions](const PositionedReader* reader) { positions = reader; };
    input.maximumGap = options.maximumGap;
    input.isDone = [&output] { return !output.isOpen(); };
    const bool good = analyseFiles(input, *feed, lines);
    feed->finish();
    groups.finish();
    if (!hasGroups && good)
        writer->write({});
    return good;
}

} // namespace

int runStats(const StatsOptions& given, DecoderLines& lines, Output& output) {
    StatsOptions options = given;
    if (options.files.empty() && ::isatty(STDIN_FILENO) != 0) {
        report("no FILE, and standard input is a terminal");
        return ExitStatus::Usage;
    }
    if (options.files.empty())
        options.files.emplace_back("-");
    FileTechnologies technologies;
    bool checksPaths = false;
    {
        const KnownCatalogues known(options.selection, options.technology, options.files, technologies);
        if (known.areAll()) {
            if (const auto problem = impossiblePath(options.selection, known.catalogues())) {
                report("--select: " + *problem);
                return ExitStatus::Usage;
            }
        }
        // Of several files another may have the path.
        checksPaths = !known.areAll() && options.files.size() == 1;
    }
    try {
        const bool good = writeStatistics(options, checksPaths, lines, output);
        output.flush();
        return good && output.state() != Output::State::Failed ? ExitStatus::Done : ExitStatus::BadInput;
    } catch (const ImpossiblePath& impossible) {
        report(std::string("--select: ") + impossible.what());
        return ExitStatus::Usage;
    }
}

} // namespace velmora

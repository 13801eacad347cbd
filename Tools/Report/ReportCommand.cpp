// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Report/ReportCommand.h"

#include "Export/Tracks/TrackCollector.h"
#include "Recorder/OverwriteTarget.h"
#include "Tools/Analysed/AnalysedFiles.h"
#include "Tools/ExitStatus.h"
#include "Tools/Log/DecoderLog.h"
#include "Tools/MadeFile.h"
#include "Tools/Output.h"
#include "Tools/OutputGuard.h"
#include "Tools/Report.h"
#include "Tools/Report/ReportAnalysis.h"
#include "Tools/Rules/RuleFiles.h"

#include <algorithm>
#include <filesystem>
#include <optional>

namespace velmora {

namespace {

/// The names of the files on the page: without directories, which are private; numbered where several are the
/// same.
std::vector<std::string> shownNames(const std::vector<std::string>& files) {
    std::vector<std::string> names;
    for (const std::string& file : files) {
        const std::string title = fileTitle(file);
        const std::string name = std::filesystem::path(title).filename().string();
        const auto isSame = [&](const std::string& other) {
            return std::filesystem::path(fileTitle(other)).filename().string() == name;
        };
        const auto same = std::count_if(files.begin(), files.end(), isSame);
        names.push_back(same > 1 ? name + " (" + std::to_string(names.size() + 1) + ')' : name);
    }
    return names;
}

/// Reads the files into the report. Returns whether all of them was read.
bool readFiles(const ReportOptions& options, const std::optional<MaskOptions>& masking, DriveReport& page,
               AnalysisFeed& feed, DecoderLines& lines) {
    AnalysedInput input;
    input.files = options.files;
    input.technology = options.technology;
    input.masking = masking;
    std::optional<TrackCollector> track;
    input.opensFile = [&track](std::uint32_t, MessageReader& reader) { track.emplace(reader); };
    input.endsFile = [&page, &track](std::uint32_t index, const MessageReader& reader) {
        page.endInput(index, reader);
        page.addTrack(track->takeTrack());
        track.reset();
    };
    input.fails = [&page](std::uint32_t index, const std::string& reason) { page.fail(index, reason); };
    return analyseFiles(input, feed, lines);
}

Result<Done> writePage(const DriveReport& page, const ReportOptions& options, const AtomicFile& file) {
    Output output(file.descriptor(), options.out);
    page.write([&output](std::string_view text) { output.put(text); });
    output.flush();
    if (!output.isOpen())
        return Failure{}; // which the output has reported
    return Done();
}

/// Whether all of the input is on the page now.
Result<bool> makePage(const ReportOptions& options, const RuleSet& rules,
                      const std::optional<MaskOptions>& masking, DecoderLines& lines,
                      const AtomicFile& file) {
    DriveReport::Options setup;
    setup.files = shownNames(options.files);
    setup.rules = &rules;
    setup.hasIdentities = options.hasIdentities;
    setup.generator = "velmora-log report";
    // Of the decoders, whose catalogues the report uses.
    std::optional<DriveReport> page;
    AnalysisFeed feed(options.clock, [&page](const Catalogue& catalogue) {
        return std::make_unique<ReportAnalysis>(*page, catalogue);
    });
    page.emplace(std::move(setup));
    const bool good = readFiles(options, masking, *page, feed, lines);
    page->finish();
    if (const Result<Done> written = writePage(*page, options, file); !written)
        return Failure{written.reason()};
    return good;
}

} // namespace

int runReport(const ReportOptions& options, DecoderLines& lines) {
    for (const std::string& file : options.files)
        if (const std::string reason = whyNotWritten(file, options.out, options.force); !reason.empty()) {
            report(reason);
            return ExitStatus::BadInput;
        }
    const Result<std::filesystem::path> target = overwriteTarget(options.out);
    if (!target) {
        report(target.reason());
        return ExitStatus::BadInput;
    }
    const Result<std::optional<MaskOptions>> masking = maskOptionsOf(options.mask);
    if (!masking) {
        report(masking.reason());
        return ExitStatus::BadInput;
    }
    std::optional<DecoderLog> log(std::in_place, lines); // of the decoders whose catalogues are made
    const AllCatalogues catalogues;
    log.reset();
    const RuleSet rules = options.usesStandardRules ? loadRules(catalogues, options.rules)
                                                    : loadOnlyRules(catalogues, options.rules);
    bool good = true;
    for (const RuleError& error : rules.errors()) {
        report(error.message());
        good =
            good && std::find(options.rules.begin(), options.rules.end(), error.file) == options.rules.end();
    }
    if (!good)
        return ExitStatus::BadInput;
    const MadeFile page{{}, options.out, options.force}; // of several files, which failures name
    const bool isWhole = makeFile(page, *target, [&](const AtomicFile& file, WorkContext&) {
        return makePage(options, rules, *masking, lines, file);
    });
    return isWhole ? ExitStatus::Done : ExitStatus::BadInput;
}

} // namespace velmora

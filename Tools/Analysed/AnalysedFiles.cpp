// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Analysed/AnalysedFiles.h"

#include "Platform/PrintableText.h"
#include "Recording/OpenMessages.h"
#include "Tools/Analysed/FileMessages.h"
#include "Tools/Decode/Decoding.h"
#include "Tools/Decode/ShownProgress.h"
#include "Tools/Decode/TrackedResources.h"
#include "Tools/Log/DecoderLog.h"
#include "Tools/Mask/MaskedInput.h"
#include "Tools/Report.h"

#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

namespace {

/// `masking` gets how times move: the files follow each other, and one that began at the same time again
/// would interrupt what the others report.
bool analyseFile(std::uint32_t index, const AnalysedInput& input, std::optional<MaskOptions>& masking,
                 AnalysisFeed& feed, DecoderLines& lines) {
    const std::string& path = input.files[index];
    const std::string title = fileTitle(path);
    std::optional<ShownProgress> progress;
    FileSource::Hooks hooks;
    hooks.beforeWaiting = input.beforeWaiting;
    hooks.whileWaiting = input.whileWaiting;
    hooks.mayRead = [&progress](std::uint64_t offset) {
        if (progress && progress->get())
            progress->get()->at(offset);
        return true;
    };
    const Result<std::unique_ptr<MessageReader>> reader = openMessages(path, std::move(hooks));
    if (!reader) {
        report(title + ": " + reader.reason());
        feed.reportLoss({{index, 1}, reader.reason()});
        if (input.fails)
            input.fails(index, reader.reason());
        return false;
    }
    if (input.showsProgress)
        progress.emplace(**reader, path, input.writesAsItGoes);
    const auto clearProgress = [&progress] {
        if (progress)
            progress->clear();
    };
    const auto sumUp = [&] { lines.report(input.files.size() > 1 ? printable(title) : std::string()); };
    WorkContext context(title, [&] {
        clearProgress();
        if (input.cleanUp)
            input.cleanUp();
        sumUp();
    });
    const DecoderLog log(lines);
    const TrackedResources resources;
    std::optional<PositionedReader> positioned;
    if (input.positions || input.fixes)
        positioned.emplace(**reader, input.maximumGap).setFixes(input.fixes);
    if (input.positions)
        input.positions(&*positioned);
    MaskedInput masked(
        positioned ? *positioned : **reader, path, input.technology,
        masking && !input.technology.empty() ? technologiesOf(path) : std::vector<std::string>(), masking);
    if (input.opensFile)
        input.opensFile(index, masked.reader());
    FileMessages messages(masked.reader(), {index, path, input.technology}, feed, context);
    messages.setProgress(progress ? progress->get() : nullptr);
    Result<Done> analysed = messages.run(input.isDone);
    if (input.positions)
        input.positions(nullptr);
    if (analysed && !resources.failure().empty())
        analysed = Failure{"decoded without its template: " + resources.failure()};
    clearProgress();
    if (masking && masked.shift())
        masking->shift = masked.shift();
    if (input.endsFile)
        input.endsFile(index, masked.reader());
    if (!analysed) {
        report(title + ": " + analysed.reason());
        if (input.fails)
            input.fails(index, analysed.reason());
    }
    const bool allDecoded = analysed && messages.undecoded().report(title);
    const bool whole = reportLosses(**reader, title);
    sumUp();
    return allDecoded && whole;
}

} // namespace

bool analyseFiles(const AnalysedInput& input, AnalysisFeed& feed, DecoderLines& lines) {
    bool good = true;
    std::optional<MaskOptions> masking = input.masking;
    for (std::uint32_t index = 0; index < input.files.size() && !(input.isDone && input.isDone()); ++index) {
        if (input.beginsFile)
            input.beginsFile(index);
        good = analyseFile(index, input, masking, feed, lines) && good;
    }
    return good;
}

} // namespace velmora

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
#include "Tools/Report.h"

#include <memory>
#include <optional>

namespace velmora {

namespace {

bool analyseFile(std::uint32_t index, const AnalysedInput& input, AnalysisFeed& feed, DecoderLines& lines) {
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
    if (input.positions)
        input.positions(&positioned.emplace(**reader, input.maximumGap));
    FileMessages messages(positioned ? *positioned : **reader, {index, path, input.technology}, feed,
                          context);
    messages.setProgress(progress ? progress->get() : nullptr);
    Result<Done> analysed = messages.run(input.isDone);
    if (input.positions)
        input.positions(nullptr);
    if (analysed && !resources.failure().empty())
        analysed = Failure{"decoded without its template: " + resources.failure()};
    clearProgress();
    if (!analysed)
        report(title + ": " + analysed.reason());
    const bool allDecoded = analysed && messages.undecoded().report(title);
    const bool whole = reportLosses(**reader, title);
    sumUp();
    return allDecoded && whole;
}

} // namespace

bool analyseFiles(const AnalysedInput& input, AnalysisFeed& feed, DecoderLines& lines) {
    bool good = true;
    for (std::uint32_t index = 0; index < input.files.size() && !(input.isDone && input.isDone()); ++index) {
        if (input.beginsFile)
            input.beginsFile(index);
        good = analyseFile(index, input, feed, lines) && good;
    }
    return good;
}

} // namespace velmora

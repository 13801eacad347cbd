// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/DecodeCommand.h"

#include "Export/Tracks/PositionedReader.h"
#include "Platform/PrintableText.h"
#include "Recording/OpenMessages.h"
#include "Tools/Decode/CSVRows.h"
#include "Tools/Decode/DecodeWriter.h"
#include "Tools/Decode/Jobs/JobScheduler.h"
#include "Tools/Decode/Jobs/UsableProcessors.h"
#include "Tools/Decode/Paths/FileTechnologies.h"
#include "Tools/Decode/Paths/KnownCatalogues.h"
#include "Tools/Decode/Paths/PathCheck.h"
#include "Tools/Decode/Samples/SampleRows.h"
#include "Tools/Decode/Samples/WideRows.h"
#include "Tools/Decode/ShownProgress.h"
#include "Tools/ExitStatus.h"
#include "Tools/Log/DecoderLog.h"
#include "Tools/Mask/MaskOption.h"
#include "Tools/Mask/MaskedInput.h"
#include "Tools/Output.h"
#include "Tools/Report.h"

#include <algorithm>
#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include <unistd.h>

namespace velmora {

namespace {

bool writesAsItGoes(const DecodeOptions& options) {
    return options.format == DecodeOptions::Format::JsonLines || options.format == DecodeOptions::Format::Csv;
}

/// Whether a file's technologies have to be known from the start.
bool needsTechnologies(const DecodeOptions& options) {
    return !options.technology.empty() || (options.format == DecodeOptions::Format::JsonLines &&
                                           options.every == DecodeOptions::Every::Message);
}

/// Whether csv needs a column for the technology. Only files that can be read twice are looked at, and they
/// make it a rule for the others as well.
bool needsTechnologyColumn(const DecodeOptions& options, FileTechnologies& technologies) {
    return options.format == DecodeOptions::Format::Csv && options.technology.empty() &&
           std::any_of(options.files.begin(), options.files.end(),
                       [&](const std::string& file) { return technologies.of(file).size() > 1; });
}

DecodingRequest requestFor(const std::string& path, const DecodeOptions& options,
                           FileTechnologies& technologies) {
    using Several = DecodingRequest::Several;
    DecodingRequest request;
    request.technology = options.technology;
    request.messages = options.messages;
    request.isStrict = options.isStrict;
    const bool lacksColumn = options.format == DecodeOptions::Format::Csv && !options.hasTechnologyColumn;
    request.several = lacksColumn && options.technology.empty() ? Several::First : Several::Decode;
    if (needsTechnologies(options))
        request.technologies = technologies.of(path);
    if (path == "-")
        request.checkDecoder = [&options](LogGenerator& decoder) {
            if (options.selection.paths().empty() || options.files.size() > 1)
                return; // another file may have it
            if (const auto problem = impossiblePath(options.selection, {&decoder.catalogue()}))
                throw ImpossiblePath(*problem);
        };
    return request;
}

/// What decoding the files has in common.
struct Work {
    DecodeOptions options;
    std::optional<MaskOptions> masking;
    FileTechnologies technologies;
    SampleColumns columns;
};

/// Decodes one file and prints it. `mayShowProgress` as ShownProgress takes it. Returns whether all of the
/// file was read.
bool decodeFile(std::size_t index, const std::function<bool()>& mayShowProgress, Work& work,
                DecoderLines& lines, Output& output) {
    const DecodeOptions& options = work.options;
    const std::string& path = options.files[index];
    const std::string title = fileTitle(path);
    DecodingRequest request = requestFor(path, options, work.technologies);
    // What has been decoded is written before more is waited for: at the other end a reader may wait for it.
    std::unique_ptr<DecodeWriter> writer;
    std::optional<ShownProgress> progress;
    FileSource::Hooks hooks;
    hooks.beforeWaiting = [&writer] {
        if (writer)
            writer->flush();
    };
    hooks.mayRead = [&progress](std::uint64_t offset) {
        if (progress && progress->get())
            progress->get()->at(offset);
        return true;
    };
    const Result<std::unique_ptr<MessageReader>> reader = openMessages(path, std::move(hooks));
    if (!reader) {
        report(title + ": " + reader.reason());
        return false;
    }
    const bool isLive = !inputSize(path);
    writer = DecodeWriter::make(options, index, isLive, work.columns, output);
    progress.emplace(**reader, path, writesAsItGoes(options), mayShowProgress);
    const auto clearProgress = [&progress] {
        if (progress)
            progress->clear();
    };
    const auto sumUp = [&] { lines.report(options.files.size() > 1 ? printable(title) : std::string()); };
    WorkContext context(title, [&] {
        clearProgress();
        writer->flush();
        sumUp();
    });
    request.progress = progress ? progress->get() : nullptr;
    // Over the progress line, which only lines that are written replace.
    const DecoderLog log(lines);
    // Below the mask, so that the position is that of the message by its own time.
    std::optional<PositionedReader> positioned;
    if (options.hasPositions)
        writer->setPositions(positioned.emplace(**reader, options.maximumGap));
    MessageReader& messages = positioned ? *positioned : **reader;
    MaskedInput input(messages, path, request.technology, request.technologies, work.masking);
    const Result<DecodedFile> decoded = decodeMessages(input.reader(), request, context, *writer);
    clearProgress();
    if (decoded)
        for (const Decoded& technology : decoded->technologies)
            writer->finish(technology);
    else
        report(title + ": " + decoded.reason());
    const bool allDecoded = decoded && decoded->undecoded.report(title);
    const bool whole = reportLosses(**reader, title);
    sumUp();
    return allDecoded && whole;
}

std::string headerOf(const DecodeOptions& options, const SampleColumns& columns) {
    switch (options.samples) {
    case DecodeOptions::Samples::None: break;
    case DecodeOptions::Samples::Long: return SampleRows::header(options);
    case DecodeOptions::Samples::Wide:
        return columns.columns().empty() ? std::string() : WideRows::header(options, columns);
    }
    return CSVRows::header(options);
}

/// How many files are decoded at a time.
std::size_t jobsFor(const DecodeOptions& options) {
    const std::size_t files = options.files.size();
    // Standard input that is named twice is read by one process: the second reader gets what is left.
    if (files == 1 || std::count(options.files.begin(), options.files.end(), "-") > 1)
        return 1;
    if (options.jobs)
        return std::min(*options.jobs, files);
    std::size_t pipes = 0;
    std::uint64_t bytes = 0;
    for (const std::string& file : options.files) {
        const std::optional<std::uint64_t> size = inputSize(file);
        pipes += size ? 0 : 1;
        bytes += size.value_or(0);
    }
    // Several pipes may be written by one program, which fills the second one after the first. And a process
    // costs two milliseconds, in which a small file is decoded.
    constexpr std::uint64_t smallFile = std::uint64_t{8} << 20;
    const bool areSmall = pipes == 0 && bytes < files * smallFile;
    return pipes > 1 || areSmall ? 1 : std::min(usableProcessors(), files);
}

} // namespace

int runDecode(const DecodeOptions& given, DecoderLines& lines, Output& output) {
    const Result<std::optional<MaskOptions>> masking = maskOptionsOf(given.mask);
    if (!masking) {
        report(masking.reason());
        return ExitStatus::BadInput;
    }
    Work work{given, *masking, {}, {}};
    DecodeOptions& options = work.options;
    FileTechnologies& technologies = work.technologies;
    SampleColumns& columns = work.columns;
    options.hasTechnologyColumn = needsTechnologyColumn(options, technologies);
    const KnownCatalogues known(options.selection, options.technology, options.files, technologies);
    const auto problem =
        known.areAll() ? impossiblePath(options.selection, known.catalogues()) : std::nullopt;
    if (problem) {
        report("--select: " + *problem);
        return ExitStatus::Usage;
    }
    for (const Catalogue* const catalogue : known.catalogues())
        columns.add(options.selection, *catalogue);
    if (options.format == DecodeOptions::Format::Csv)
        output.put(headerOf(options, columns));
    const std::size_t jobs = known.areAll() ? jobsFor(options) : 1;
    bool good = true;
    if (jobs > 1) {
        const bool hasTerminal = ::isatty(STDERR_FILENO) != 0;
        const Job job = [&](std::size_t index, Output& part) {
            const auto isShown = [&] { return hasTerminal && part.isFirst(); };
            return decodeFile(index, isShown, work, lines, part);
        };
        good = JobScheduler(options.files.size(), jobs, job, output).run();
    } else {
        try {
            for (std::size_t index = 0; index < options.files.size() && output.isOpen(); ++index)
                good = decodeFile(index, {}, work, lines, output) && good;
        } catch (const ImpossiblePath& impossible) {
            report(std::string("--select: ") + impossible.what());
            return ExitStatus::Usage;
        }
    }
    output.flush();
    return good && output.state() != Output::State::Failed ? ExitStatus::Done : ExitStatus::BadInput;
}

} // namespace velmora

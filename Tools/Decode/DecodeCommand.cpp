// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/DecodeCommand.h"

#include "Platform/Linux/MachineClock.h"
#include "Recording/OpenMessages.h"
#include "Tools/Decode/CSVRows.h"
#include "Tools/Decode/DecodeProgress.h"
#include "Tools/Decode/DecodeWriter.h"
#include "Tools/Decode/Jobs/JobScheduler.h"
#include "Tools/Decode/PathCheck.h"
#include "Tools/Decode/Samples/SampleWriter.h"
#include "Tools/Decode/Samples/WideRows.h"
#include "Tools/ExitStatus.h"
#include "Tools/LogOverride.h"
#include "Tools/Output.h"
#include "Tools/Report.h"
#include "Tools/Technologies.h"
#include "Tools/Text/PrintableText.h"

#include <algorithm>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include <unistd.h>

namespace velmora {

namespace {

bool writesAsItGoes(const DecodeOptions& options) {
    return options.format == DecodeOptions::Format::JsonLines || options.format == DecodeOptions::Format::Csv;
}

/// The progress of one file on standard error, if that is a terminal and the file is long enough.
class ShownProgress {
public:
    ShownProgress(const std::string& path, const DecodeOptions& options) {
        if (::isatty(STDERR_FILENO) == 0)
            return;
        // On the same terminal it would mix with the lines.
        if (writesAsItGoes(options) && ::isatty(STDOUT_FILENO) != 0)
            return;
        const std::optional<std::uint64_t> size = inputSize(path);
        if (!size || *size <= DecodeProgress::smallestInput)
            return;
        _line.emplace();
        _progress.emplace(*size, _clock, [this](std::string_view text) { _line->show(text); });
    }

    [[nodiscard]] DecodeProgress* get() { return _progress ? &*_progress : nullptr; }
    /// Clears the line, before anything else is written there.
    void clear() {
        if (_line)
            _line->clear();
    }

private:
    MachineClock _clock;
    std::optional<ProgressLine> _line;
    std::optional<DecodeProgress> _progress;
};

/// Decodes one file and prints it. Returns whether all of it was read.
bool decodeFile(std::size_t index, const DecodeOptions& options, bool showsProgress, SampleColumns& columns,
                Output& output) {
    const std::string& path = options.files[index];
    const std::string title = fileTitle(path);
    const Result<std::unique_ptr<MessageReader>> reader = openMessages(path);
    if (!reader) {
        report(title + ": " + reader.reason());
        return false;
    }
    std::string heading;
    if (options.files.size() > 1)
        heading = (index > 0 ? "\n== " : "== ") + printable(title) + " ==\n";
    const bool isLive = !inputSize(path);
    const std::unique_ptr<DecodeWriter> writer =
        DecodeWriter::make(options, path, isLive, heading, columns, output);
    std::optional<ShownProgress> progress;
    if (showsProgress)
        progress.emplace(path, options);
    const auto clearProgress = [&progress] {
        if (progress)
            progress->clear();
    };
    WorkContext context(title, [&] {
        clearProgress();
        writer->flush();
    });
    const Result<Decoded> decoded =
        decodeMessages(**reader, {options.technology, options.range, progress ? progress->get() : nullptr},
                       context, *writer);
    clearProgress();
    if (decoded)
        writer->finish(*decoded);
    else
        report(title + ": " + decoded.reason());
    const bool whole = reportLosses(**reader, title);
    return decoded && whole;
}

/// Decoders of the technologies of the files, for their catalogues. What standard input holds is not known
/// before it is decoded.
class Technologies {
public:
    explicit Technologies(const DecodeOptions& options) {
        if (options.selection.paths().empty())
            return;
        if (!options.technology.empty())
            add(options.technology);
        else if (std::find(options.files.begin(), options.files.end(), "-") == options.files.end())
            for (const std::string& file : options.files)
                if (const auto reader = openMessages(file)) {
                    static_cast<void>((*reader)->next());
                    add((*reader)->technology());
                }
    }

    [[nodiscard]] const std::vector<const Catalogue*>& catalogues() const { return _catalogues; }

private:
    void add(const std::string& technology) {
        const Result<std::string> constant = technologyNamed(technology);
        if (!constant || std::find(_names.begin(), _names.end(), *constant) != _names.end())
            return;
        _names.push_back(*constant);
        if (Result<std::unique_ptr<LogGenerator>> decoder = makeDecoder(*constant, _clock)) {
            _catalogues.push_back(&(*decoder)->catalogue());
            _decoders.push_back(*std::move(decoder));
        }
    }

    MachineClock _clock;
    std::vector<std::string> _names;
    std::vector<std::unique_ptr<LogGenerator>> _decoders;
    std::vector<const Catalogue*> _catalogues;
};

std::string headerOf(const DecodeOptions& options, const SampleColumns& columns) {
    switch (options.samples) {
    case DecodeOptions::Samples::None: break;
    case DecodeOptions::Samples::Long: return SampleRows::header(options);
    case DecodeOptions::Samples::Wide:
        return columns.columns().empty() ? std::string() : WideRows::header(options, columns);
    }
    return CSVRows::header(options);
}

} // namespace

int runDecode(const DecodeOptions& options, Output& output) {
    Technologies technologies(options);
    if (const auto problem = impossiblePath(options.selection, technologies.catalogues())) {
        report("--select: " + *problem);
        return ExitStatus::Usage;
    }
    SampleColumns columns;
    for (const Catalogue* const catalogue : technologies.catalogues())
        columns.add(options.selection, *catalogue);
    if (options.format == DecodeOptions::Format::Csv)
        output.put(headerOf(options, columns));
    // Standard input that is named twice is read by one process: the second reader gets what is left.
    const std::ptrdiff_t standardInputs = std::count(options.files.begin(), options.files.end(), "-");
    const std::size_t jobs = standardInputs > 1 ? 1 : std::min(options.jobs, options.files.size());
    bool good = true;
    if (jobs > 1) {
        const Job job = [&](std::size_t index, Output& part) {
            return decodeFile(index, options, false, columns, part);
        };
        good = JobScheduler(options.files.size(), jobs, job, output).run();
    } else {
        for (std::size_t index = 0; index < options.files.size() && output.isOpen(); ++index)
            good = decodeFile(index, options, true, columns, output) && good;
    }
    output.flush();
    return good && output.state() != Output::State::Failed ? ExitStatus::Done : ExitStatus::BadInput;
}

} // namespace velmora

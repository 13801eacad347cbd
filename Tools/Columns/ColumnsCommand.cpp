// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Columns/ColumnsCommand.h"

#include "Platform/PrintableText.h"
#include "Recording/OpenMessages.h"
#include "Tools/Columns/ColumnFiles.h"
#include "Tools/Columns/ColumnsObserver.h"
#include "Tools/Columns/Compaction.h"
#include "Tools/Columns/ContentHash.h"
#include "Tools/Columns/HashedInput.h"
#include "Tools/Columns/JoinedFiles.h"
#include "Tools/ExitStatus.h"
#include "Tools/Log/DecoderLog.h"
#include "Tools/LogOverride.h"
#include "Tools/Mask/MaskedInput.h"
#include "Tools/Output.h"
#include "Tools/Report.h"
#include "Tools/Rules/RuleFiles.h"

#include <filesystem>
#include <memory>
#include <optional>
#include <set>
#include <string>
#include <system_error>
#include <vector>

namespace velmora {

namespace {

/// What became of a file, for the user.
struct Outcome {
    std::string text;
    bool isGood = false;
};

Outcome failed(const std::string& title, const std::string& reason) {
    report(title + ": " + reason);
    return {"failed", false};
}

Result<std::unique_ptr<MessageReader>> openAgain(const HashedInput& input, InputError& error) {
    Result<std::unique_ptr<ByteSource>> source = input.read(error);
    if (!source)
        return Failure{source.reason()};
    return openMessages(ChunkedInput(*std::move(source)));
}

/// What the names of a file's tables follow from: its first message.
struct Begin {
    std::optional<Time> first;
    std::string technology; ///< empty where the file does not name it
};

Result<Begin> beginOf(const std::string& path, const HashedInput& input, const ColumnsOptions& options,
                      const std::optional<MaskOptions>& masking) {
    InputError error;
    const Result<std::unique_ptr<MessageReader>> reader = openAgain(input, error);
    if (!reader)
        return Failure{reader.reason()};
    MaskedInput masked(**reader, path, options.technology, {}, masking);
    masked.reader().setReadsAllTechnologies(true);
    Begin begin;
    if (const std::optional<LoggedMessage> message = masked.reader().next())
        begin.first = message->time;
    begin.technology = (*reader)->technology();
    if (error.reason)
        return Failure{*error.reason};
    return begin;
}

/// By what all tables name the input. Masked it is another one, so that it never counts as what is there
/// unmasked, or masked less.
std::string hashOf(const HashedInput& input, const std::optional<MaskOptions>& masking) {
    if (!masking)
        return input.hash();
    ContentHash hash;
    for (const std::string& each :
         {input.hash(), std::string(nameOf(masking->level)), masking->key.fingerprint()})
        hash.add(std::vector<std::uint8_t>(each.begin(), each.end()));
    return hash.digits();
}

InputFile fileOf(const std::string& path, const HashedInput& input, const MessageReader& reader,
                 const std::optional<MaskOptions>& masking) {
    InputFile file;
    file.hash = hashOf(input, masking);
    // Directories may have the name of a person.
    file.name = masking ? std::filesystem::path(path).filename().string() : path;
    file.form = reader.form();
    file.size = input.size();
    file.losses = reader.lossTotals().losses;
    file.lostBytes = reader.lossTotals().bytes;
    file.isComplete = file.losses == 0 && !reader.failure();
    return file;
}

/// Decodes a file and writes its tables.
Outcome writeFile(const std::string& path, const HashedInput& input, const Begin& begin,
                  const ColumnsOptions& options, const std::optional<MaskOptions>& masking,
                  const RuleSet& rules, DecoderLines& lines) {
    const std::string title = fileTitle(path);
    InputError error;
    const Result<std::unique_ptr<MessageReader>> reader = openAgain(input, error);
    if (!reader)
        return failed(title, reader.reason());
    ColumnFiles files(options.out, dateOf(begin.first), hashOf(input, masking));
    InputColumns columns(fileOf(path, input, **reader, masking), rules, files);
    const auto sumUp = [&] { lines.report(options.files.size() > 1 ? printable(title) : std::string()); };
    WorkContext context(title, [&] {
        files.discard();
        sumUp();
    });
    DecodingRequest request;
    if (begin.technology.empty())
        request.technology = options.technology;
    const DecoderLog log(lines);
    // Below the mask, so that the position is that of the message by its own time.
    PositionedReader positioned(**reader);
    if (options.technology.empty() && !begin.technology.empty())
        columns.beginPositions(begin.technology);
    const bool hasPositions = !masking || masking->level != MaskLevel::All;
    if (hasPositions)
        positioned.setFixes([&columns](const Fix& fix) { columns.add(fix); });
    MaskedInput masked(positioned, path, request.technology, {}, masking);
    ColumnsObserver observer(columns, masked.reader(), hasPositions ? &positioned : nullptr);
    const Result<DecodedFile> decoded = decodeMessages(masked.reader(), request, context, observer);
    if (!decoded) {
        static_cast<void>(reportLosses(**reader, title));
        sumUp();
        return failed(title, decoded.reason());
    }
    const bool allDecoded = decoded->undecoded.report(title);
    const bool whole = reportLosses(**reader, title);
    sumUp();
    observer.finish();
    Result<Done> written = columns.finish(fileOf(path, input, **reader, masking));
    // Another time it may be read to its end: what there is of it is not what the input holds.
    if (written && error.reason)
        return {"failed", false}; // for the reason that has been reported
    if (written && input.hasGrown())
        written = Failure{"has been written to while it was read"};
    if (written)
        written = files.commit();
    if (!written)
        return failed(title, written.reason());
    return {std::string(allDecoded && whole ? "written" : "written with losses") + ": " +
                std::to_string(columns.tables()) + " tables, " + std::to_string(columns.rows()) + " rows, " +
                std::to_string(files.bytes()) + " bytes",
            allDecoded && whole};
}

Outcome takeFile(const std::string& path, const ColumnsOptions& options,
                 const std::optional<MaskOptions>& masking, const RuleSet& rules, WrittenInputs& written,
                 DecoderLines& lines) {
    const std::string title = fileTitle(path);
    const Result<HashedInput> input = HashedInput::open(path);
    if (!input)
        return failed(title, input.reason());
    const Result<Begin> begin = beginOf(path, *input, options, masking);
    if (!begin)
        return failed(title, begin.reason());
    const std::string& technology = begin->technology.empty() ? options.technology : begin->technology;
    if (written.contains(options.out / partitionOf("files", technology, dateOf(begin->first)),
                         hashOf(*input, masking)))
        return {"there already", true};
    return writeFile(path, *input, *begin, options, masking, rules, lines);
}

int writeAllFiles(const ColumnsOptions& options, DecoderLines& lines, Output& output) {
    const Result<std::optional<MaskOptions>> masking = maskOptionsOf(options.mask);
    if (!masking) {
        report(masking.reason());
        return ExitStatus::BadInput;
    }
    std::optional<DecoderLog> log(std::in_place, lines); // of the decoders whose catalogues are made
    const AllCatalogues catalogues;
    log.reset();
    const RuleSet rules = loadBuiltInRules(catalogues);
    bool good = true;
    WrittenInputs written;
    for (const std::string& path : options.files) {
        const Outcome outcome = takeFile(path, options, *masking, rules, written, lines);
        good = good && outcome.isGood;
        output.put(printable(fileTitle(path)) + ": " + outcome.text + "\n");
        output.flush();
    }
    return good ? ExitStatus::Done : ExitStatus::BadInput;
}

/// The directories of a table, a technology and a day.
Result<std::set<std::filesystem::path>> partitionsIn(const std::filesystem::path& root) {
    std::set<std::filesystem::path> partitions;
    std::error_code error;
    constexpr int depth = 2; // of the day below the table
    for (std::filesystem::recursive_directory_iterator each(root, error), end; !error && each != end;
         each.increment(error))
        if (each.depth() == depth && each->is_directory(error) &&
            each->path().filename().string().starts_with("date="))
            partitions.insert(each->path());
    if (error)
        return Failure{"cannot be read: " + error.message()};
    return partitions;
}

int compactAll(const std::filesystem::path& root, Output& output) {
    const Result<std::set<std::filesystem::path>> partitions = partitionsIn(root);
    if (!partitions) {
        report(root.string() + ": " + partitions.reason());
        return ExitStatus::BadInput;
    }
    bool good = true;
    for (const std::filesystem::path& partition : *partitions) {
        Compaction compaction(partition, [](const std::string& problem) { report(problem); });
        good = compaction.run() && good;
        if (compaction.removed() > 0)
            output.put(printable(partition.string()) + ": " + std::to_string(compaction.removed()) +
                       " files joined in " + std::to_string(compaction.made()) + "\n");
        output.flush();
    }
    return good ? ExitStatus::Done : ExitStatus::BadInput;
}

} // namespace

int runColumns(const ColumnsOptions& options, DecoderLines& lines, Output& output) {
    const int status =
        options.compact.empty() ? writeAllFiles(options, lines, output) : compactAll(options.compact, output);
    return output.state() == Output::State::Failed ? ExitStatus::BadInput : status;
}

} // namespace velmora

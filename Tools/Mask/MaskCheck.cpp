// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Mask/MaskCheck.h"

#include "Export/Masking/KnownValues.h"
#include "Export/Masking/MessageMask.h"
#include "Export/Masking/Sealing/SealedFile.h"
#include "Export/Masking/TechnologyName.h"
#include "Platform/Linux/Files/Files.h"
#include "PropertyLists/PropertyList.h"
#include "Recording/Files/GzipSource.h"
#include "Recording/OpenMessages.h"
#include "Recording/Positions/NMEASentence.h"
#include "Tools/Decode/Decoding.h"
#include "Tools/ExitStatus.h"
#include "Tools/Mask/ReportText.h"
#include "Tools/Output.h"
#include "Tools/Report.h"

#include <algorithm>
#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace velmora {

namespace {

constexpr std::size_t largestKnownFile = std::size_t{16} << 20;
constexpr std::size_t window = std::size_t{1} << 20;

/// What is looked for, and the number of each value's line.
struct KnownLines {
    std::vector<std::string> values;
    std::vector<std::size_t> numbers;
};

Result<KnownLines> readKnown(const std::string& path) {
    const Result<Data> content = readFile(path, largestKnownFile);
    if (!content)
        return Failure{path + ": " + content.reason()};
    KnownLines lines;
    std::string line;
    std::size_t number = 1;
    std::string failure;
    const auto end = [&] {
        if (!line.empty() && line.size() < shortestEncoding && failure.empty())
            failure =
                path + ": line " + std::to_string(number) + " is too short, wanted 4 characters or more";
        if (!line.empty()) {
            lines.values.push_back(line);
            lines.numbers.push_back(number);
        }
        line.clear();
        ++number;
    };
    for (const std::uint8_t byte : content->bytes()) {
        if (byte == '\n')
            end();
        else if (byte != '\r')
            line += static_cast<char>(byte);
    }
    end();
    if (!failure.empty())
        return Failure{failure};
    return lines;
}

void searchAll(KnownValues& known, ChunkedInput input) {
    while (input.ensure(1)) {
        const bool isMore = input.ensure(window);
        const Bytes bytes = input.available();
        known.search(bytes);
        if (!isMore)
            break;
        input.skip(bytes.size() - std::min(known.overlap(), bytes.size() - 1));
    }
}

/// The file as it is, what it unpacks to, what its property lists and messages hold.
Result<Done> searchFile(KnownValues& known, const std::string& path) {
    Result<std::unique_ptr<ByteSource>> source = FileSource::open(path);
    if (!source)
        return Failure{path + ": " + source.reason()};
    searchAll(known, ChunkedInput(*std::move(source)));
    if (source = FileSource::open(path); source) {
        ChunkedInput input(*std::move(source));
        static_cast<void>(input.ensure(4));
        if (isGzip(input.available()))
            searchAll(known, ChunkedInput(std::make_unique<GzipSource>(std::move(input))));
    }
    const Result<std::unique_ptr<MessageReader>> reader = openMessages(path);
    if (!reader)
        return Failure{path + ": " + reader.reason()};
    if ((*reader)->form() == "snapshot")
        if (const Result<Data> content = readFile(path, std::size_t{256} << 20))
            if (const Result<Value> list = readPropertyList(content->bytes()))
                known.search(*list);
    (*reader)->setReadsAllTechnologies(true);
    constexpr std::size_t headerLength = 13;
    constexpr std::size_t prefixedLength = 15;
    while (const auto message = (*reader)->next()) {
        const Bytes bytes = message->message.bytes();
        known.search(bytes);
        for (const std::size_t offset : {std::size_t{0}, headerLength, prefixedLength})
            if (offset < bytes.size() && (bytes[offset] == 'b' || bytes[offset] == '<'))
                if (const Result<Value> list = readPropertyList(bytes.subspan(offset)))
                    known.search(*list);
    }
    return Done{};
}

/// Whether the sentence is removed at that level: all are at the last one, and a maker's own at any.
bool isMasked(const PositionSentence& text, const MaskOptions& masking) {
    const auto sentence = NMEASentence::parse(text.text);
    return masking.masksTimes() || (!masking.done && (!sentence || sentence->kind().empty()));
}

Result<MaskReport> identitiesLeft(const MaskCommandOptions& options, bool& isWhole) {
    Result<std::unique_ptr<ByteSource>> source = FileSource::open(options.file);
    const Result<MaskKey> key = MaskKey::random();
    if (!source || !key)
        return Failure{source ? key.reason() : options.file + ": " + source.reason()};
    MaskOptions masking{*key, options.level};
    if (const auto seal = readSeal(ChunkedInput(*std::move(source)))) {
        masking.done = seal->level;
        // The times of a file have been moved, or have not.
        masking.level = std::max(options.level, std::min(seal->level, MaskLevel::Location));
    }
    const Result<std::unique_ptr<MessageReader>> reader = openMessages(options.file);
    if (!reader)
        return Failure{options.file + ": " + reader.reason()};
    MessageMask mask(masking);
    std::uint64_t sentences = 0;
    (*reader)->setSentences(
        [&](const PositionSentence& each) { sentences += isMasked(each, masking) ? 1 : 0; });
    (*reader)->setReadsAllTechnologies(true);
    while (const auto message = (*reader)->next()) {
        const std::string name = technologyOf(*message, **reader);
        static_cast<void>(mask.mask(*message, name.empty() ? options.technology : name));
    }
    MaskReport report = mask.report();
    report.add(Masked::Position, sentences);
    for (const Comment& comment : (*reader)->comments().first())
        if (!MaskSeal::read(comment.text))
            report.add(Masked::Comment);
    // What a sealed file's reader does not find is as it was masked nevertheless.
    isWhole = reportLosses(**reader, options.file) || masking.done;
    return report;
}

bool isClean(const MaskReport& report) {
    return std::ranges::all_of(report.counts, [](std::uint64_t count) { return count == 0; });
}

} // namespace

int runMaskCheck(const MaskCommandOptions& options, Output& output) {
    bool isWhole = true;
    const Result<MaskReport> left = identitiesLeft(options, isWhole);
    if (!left) {
        report(left.reason());
        return ExitStatus::BadInput;
    }
    output.put(isClean(*left) ? options.file + ": no identities of level " +
                                    std::string(nameOf(options.level)) + " in clear\n"
                              : leftText(options.file, *left));
    bool isFound = false;
    if (!options.knownFile.empty()) {
        const Result<KnownLines> lines = readKnown(options.knownFile);
        if (!lines) {
            report(lines.reason());
            return ExitStatus::BadInput;
        }
        KnownValues known(lines->values);
        if (const auto searched = searchFile(known, options.file); !searched) {
            report(searched.reason());
            return ExitStatus::BadInput;
        }
        for (const auto& [value, encoding] : known.findings())
            output.put(options.file + ": line " + std::to_string(lines->numbers[value]) + " of " +
                       options.knownFile + " found: " + std::string(nameOf(encoding)) + "\n");
        isFound = !known.findings().empty();
    }
    output.flush();
    const bool isFine = isClean(*left) && !isFound && isWhole && output.state() != Output::State::Failed;
    return isFine ? ExitStatus::Done : ExitStatus::BadInput;
}

} // namespace velmora

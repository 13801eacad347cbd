// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Convert/ConvertCommand.h"

#include "Platform/Linux/Files/AtomicFile.h"
#include "Platform/Linux/Files/Files.h"
#include "Recorder/OverwriteTarget.h"
#include "Recording/OpenMessages.h"
#include "Recording/Positions/TrackFile.h"
#include "Tools/Convert/Conversion.h"
#include "Tools/Decode/Decoding.h"
#include "Tools/Decode/RefreshCount.h"
#include "Tools/ExitStatus.h"
#include "Tools/Messages/TechnologyChoice.h"
#include "Tools/OutputGuard.h"
#include "Tools/Report.h"
#include "Tools/Stats/StatsOptions.h"

#include <filesystem>
#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include <sys/stat.h>
#include <unistd.h>

namespace velmora {

namespace {

constexpr mode_t newFileMode = S_IRUSR | S_IWUSR;

/// How many refreshes the file takes; none where it is no regular file, which can be read but once.
std::optional<std::uint64_t> refreshesOf(const std::string& file, const Conversion& conversion) {
    struct stat status = {};
    if (file == "-" || ::stat(file.c_str(), &status) != 0 || !S_ISREG(status.st_mode))
        return std::nullopt;
    const auto choice = TechnologyChoice::make(conversion.technology, conversion.technologies);
    const Result<std::unique_ptr<MessageReader>> reader = openMessages(file);
    if (!choice || !reader)
        return std::nullopt; // as will be reported
    return countRefreshes(**reader, conversion.messages, choice->only);
}

/// What a track shows: what was chosen, or how good reception was. A database has everything by default.
LeafChoice attributesOf(const ConvertOptions& options) {
    LeafChoice choice = leafChoice(options.selection, options.roles);
    if (choice.isEverything() && isTrack(*formFromName(options.out))) {
        choice.addRole(Role::ServingLevel);
        choice.addRole(Role::ServingQuality);
    }
    return choice;
}

/// Of the file with the track; none without one.
Result<std::vector<Fix>> positionsOf(const ConvertOptions& options) {
    if (options.track.empty())
        return std::vector<Fix>();
    const Result<Data> content = readFile(options.track, maximumTrackFile);
    if (!content)
        return Failure{options.track + ": " + content.reason()};
    const Bytes bytes = content->bytes();
    Result<std::vector<Fix>> fixes =
        fixesOfTrackFile({reinterpret_cast<const char*>(bytes.data()), bytes.size()});
    return fixes ? std::move(fixes) : Failure{options.track + ": " + fixes.reason()};
}

/// Whether all of the input is in the output now.
bool convert(const ConvertOptions& options, const std::filesystem::path& target, MessageReader& reader,
             const std::string& title, std::vector<Fix> positions) {
    // Before the output, so that an allocation that fails never leaves one on the disk.
    AtomicFile* made = nullptr;
    WorkContext context(title, [&made] {
        if (made)
            made->discard();
    });
    Result<AtomicFile> output = AtomicFile::create(target, newFileMode);
    if (!output) {
        report(options.out + ": " + output.reason());
        return false;
    }
    made = &*output;
    const RemovedWhenInterrupted removed(output->path());
    Conversion conversion;
    conversion.form = *formFromName(options.out);
    conversion.title = title;
    conversion.path = options.file;
    conversion.name = options.out;
    conversion.temporary = output->path();
    conversion.technology = options.technology;
    if (!options.technology.empty())
        conversion.technologies = technologiesOf(options.file);
    conversion.messages = options.messages;
    conversion.description = options.description;
    conversion.attributes = attributesOf(options);
    conversion.maximumGap = options.maximumGap;
    conversion.positions = std::move(positions);
    conversion.isStrict = options.isStrict;
    if (conversion.form == FileForm::Snapshot)
        conversion.refreshes = refreshesOf(options.file, conversion);
    const Result<bool> converted = convertMessages(reader, conversion, output->descriptor(), context);
    if (!converted) {
        report(converted.reason());
        return false;
    }
    using IfExists = AtomicFile::IfExists;
    const auto committed = output->commit(options.force ? IfExists::Replace : IfExists::Refuse);
    if (!committed)
        report(options.out + ": " + committed.reason());
    return committed && *converted;
}

} // namespace

int runConvert(const ConvertOptions& options) {
    if (const std::string reason = whyNotWritten(options.file, options.out, options.force); !reason.empty()) {
        report(reason);
        return ExitStatus::BadInput;
    }
    const Result<std::filesystem::path> target = overwriteTarget(options.out);
    if (!target) {
        report(target.reason());
        return ExitStatus::BadInput;
    }
    Result<std::vector<Fix>> positions = positionsOf(options);
    if (!positions) {
        report(positions.reason());
        return ExitStatus::BadInput;
    }
    const std::string title = fileTitle(options.file);
    const Result<std::unique_ptr<MessageReader>> reader = openMessages(options.file);
    if (!reader) {
        report(title + ": " + reader.reason());
        return ExitStatus::BadInput;
    }
    const bool converted = convert(options, *target, **reader, title, *std::move(positions));
    const bool whole = reportLosses(**reader, title);
    return converted && whole ? ExitStatus::Done : ExitStatus::BadInput;
}

} // namespace velmora

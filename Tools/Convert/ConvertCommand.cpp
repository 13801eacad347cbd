// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Convert/ConvertCommand.h"

#include "Platform/Linux/Files/Files.h"
#include "Recording/OpenMessages.h"
#include "Recording/Positions/TrackFile.h"
#include "Tools/Convert/Conversion.h"
#include "Tools/Decode/Decoding.h"
#include "Tools/Decode/RefreshCount.h"
#include "Tools/ExitStatus.h"
#include "Tools/MadeFile.h"
#include "Tools/Messages/TechnologyChoice.h"
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

Conversion conversionOf(const ConvertOptions& options, std::vector<Fix> positions) {
    Conversion conversion;
    conversion.form = *formFromName(options.out);
    conversion.title = fileTitle(options.file);
    conversion.path = options.file;
    conversion.name = options.out;
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
    return conversion;
}

} // namespace

int runConvert(const ConvertOptions& options) {
    const MadeFile file{options.file, options.out, options.force};
    const Result<std::filesystem::path> target = targetOf(file);
    if (!target) {
        report(target.reason());
        return ExitStatus::BadInput;
    }
    Result<std::vector<Fix>> positions = positionsOf(options);
    if (!positions) {
        report(positions.reason());
        return ExitStatus::BadInput;
    }
    const Result<std::unique_ptr<MessageReader>> reader = inputOf(file);
    if (!reader) {
        report(reader.reason());
        return ExitStatus::BadInput;
    }
    const bool converted = makeFile(file, *target, [&](AtomicFile& made, WorkContext& context) {
        Conversion conversion = conversionOf(options, *std::move(positions));
        conversion.temporary = made.path();
        return convertMessages(**reader, conversion, made.descriptor(), context);
    });
    const bool whole = reportLosses(**reader, fileTitle(options.file));
    return converted && whole ? ExitStatus::Done : ExitStatus::BadInput;
}

} // namespace velmora

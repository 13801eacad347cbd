// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Convert/Conversion.h"

#include "Model/Snapshot.h"
#include "Platform/Linux/Errno.h"
#include "Platform/Linux/Files/Files.h"
#include "Platform/Linux/MachineClock.h"
#include "Platform/TelephonyService.h"
#include "PropertyLists/PropertyList.h"
#include "Recording/DLF/DLFWriter.h"
#include "Recording/Pcapng/PcapngReader.h"
#include "Recording/Pcapng/PcapngWriter.h"
#include "Recording/Refreshes/RefreshTicks.h"
#include "Tools/Convert/AddedPositions.h"
#include "Tools/Convert/DatabaseConversion.h"
#include "Tools/Convert/RecordingConversion.h"
#include "Tools/Convert/SelectedMessages.h"
#include "Tools/Convert/TrackConversion.h"
#include "Tools/Decode/Decoding.h"
#include "Tools/Messages/TechnologyChoice.h"
#include "Tools/Report.h"
#include "Tools/Technologies.h"

#include <cerrno>
#include <utility>

#include <fcntl.h>

namespace velmora {

namespace {

/// A second descriptor of the file, for a writer that closes its descriptor.
Result<int> ownDescriptor(int descriptor, const std::string& name) {
    const int copy = ::fcntl(descriptor, F_DUPFD_CLOEXEC, 0);
    if (copy < 0)
        return Failure{"cannot write " + name + ": " + errnoText(errno)};
    return copy;
}

Result<bool> toRecording(MessageReader& reader, const Conversion& conversion, int descriptor) {
    if (auto* recording = dynamic_cast<PcapngReader*>(&reader))
        return convertRecording(*recording, conversion, descriptor);
    MessageFilter filter(conversion.messages);
    Result<SelectedMessages> messages = SelectedMessages::begin(reader, conversion, filter);
    if (!messages)
        return Failure{messages.reason()};
    const Result<int> own = ownDescriptor(descriptor, conversion.name);
    if (!own)
        return Failure{own.reason()};
    using Positions = PcapngWriter::Positions;
    const auto writer =
        PcapngWriter::adopt(*own, conversion.name, messages->technology,
                            conversion.positions.empty() ? Positions::Without : Positions::With);
    if (!writer)
        return Failure{writer.reason()};
    AddedPositions positions(conversion.positions);
    const auto add = [&writer](const Fix& fix) { return (*writer)->appendFix(fix); };
    for (; messages->next; messages->advance()) {
        if (const auto added = positions.upTo(messages->next->time, add); !added)
            return Failure{conversion.title + ": " + added.reason()};
        if (const auto appended = (*writer)->append(messages->next->time, messages->next->message.bytes());
            !appended)
            return Failure{appended.reason()};
    }
    if (const auto added = positions.finish(add); !added)
        return Failure{conversion.title + ": " + added.reason()};
    if (const auto closed = (*writer)->close(); !closed)
        return Failure{closed.reason()};
    return true;
}

Result<bool> toDLFLog(MessageReader& reader, const Conversion& conversion, int descriptor) {
    MessageFilter filter(conversion.messages);
    Result<SelectedMessages> messages = SelectedMessages::begin(reader, conversion, filter);
    if (!messages)
        return Failure{messages.reason()};
    const auto refuses = [&] { return !messages->isOne && reader.technologies().size() > 1; };
    if (refuses())
        return Failure{conversion.title + ": " + severalTechnologies(reader.technologies())};
    if (technologyConstant(messages->technology) == kVoxLogChannelTechnology_IFX)
        return Failure{conversion.title + ": technology " + messages->technology +
                       " has no DLF log: its messages are no records"};
    const Result<int> own = ownDescriptor(descriptor, conversion.name);
    if (!own)
        return Failure{own.reason()};
    // The log's own time is that of its first record, so that the same messages make the same log.
    MessageClock clock;
    if (messages->next)
        clock.setNow(messages->next->time);
    const auto writer = DLFWriter::adopt(*own, conversion.name, clock);
    if (!writer)
        return Failure{writer.reason()};
    for (; messages->next; messages->advance()) {
        const auto appended = (*writer)->append(messages->next->message.bytes());
        if ((*writer)->hasFailed())
            return Failure{appended.reason()};
        if (!appended && (*writer)->refused() <= MessageReader::maximumLosses)
            report(positionInFile(conversion.title, messages->next->number, messages->next->offset) +
                   ": left out: " + appended.reason());
    }
    if (refuses())
        return Failure{conversion.title + ": " + severalTechnologies(reader.technologies())};
    if (const std::uint64_t refused = (*writer)->refused(); refused > MessageReader::maximumLosses)
        report(conversion.title + ": left out " + std::to_string(refused) + " messages in all");
    if (const auto closed = (*writer)->close(); !closed)
        return Failure{closed.reason()};
    return (*writer)->refused() == 0;
}

/// Keeps what a snapshot saves.
class SaveContents final : public DecodingObserver {
public:
    /// `refreshes`: how many there will be, where that is known.
    explicit SaveContents(std::optional<std::uint64_t> refreshes) : _expected(refreshes) {}

    /// Of the last refresh; absent where there was none.
    std::optional<Time> tick;
    ArrayRef contents;

    [[nodiscard]] bool wantsHistory(std::uint64_t refreshes) const override {
        // One more than the history holds, so that all its entries begin with a refresh.
        constexpr std::uint64_t kept = 6;
        return !_expected || refreshes + kept >= *_expected;
    }
    [[nodiscard]] bool wantsEveryRefresh() const override { return false; }
    void didRefresh(Time refreshTick, const Decoded&) override { tick = refreshTick; }
    void didFinish(const LogGenerator& decoder, const Dictionary& state) override {
        contents = decoder.getSaveContentsFromState(state);
    }

private:
    std::optional<std::uint64_t> _expected;
};

Result<bool> toSnapshot(MessageReader& reader, const Conversion& conversion, int descriptor,
                        WorkContext& context) {
    SaveContents saved(conversion.refreshes);
    DecodingRequest request;
    request.technology = conversion.technology;
    request.messages = conversion.messages;
    request.several = DecodingRequest::Several::Refuse;
    request.technologies = conversion.technologies;
    request.isStrict = conversion.isStrict;
    const Result<DecodedFile> decoded = decodeMessages(reader, request, context, saved);
    if (!decoded)
        return Failure{conversion.title + ": " + decoded.reason()};
    if (conversion.refreshes && decoded->technologies.front().refreshes < *conversion.refreshes)
        return Failure{conversion.title + ": became shorter while it was read"};
    // Without a refresh there is no time but now.
    const Time timeStamp = saved.tick ? *saved.tick : MachineClock().now();
    const Result<std::string> list =
        writePropertyList(makeSnapshot(timeStamp, saved.contents, conversion.description));
    if (!list)
        return Failure{conversion.title + ": cannot be made a snapshot: " + list.reason()};
    const Bytes content(reinterpret_cast<const std::uint8_t*>(list->data()), list->size());
    if (const Result<Done> written = writeAll(descriptor, content); !written)
        return Failure{conversion.name + ": " + written.reason()};
    return decoded->undecoded.report(conversion.title);
}

} // namespace

std::optional<FileForm> formFromName(std::string_view name) {
    if (name.ends_with(".pcapng"))
        return FileForm::Recording;
    if (name.ends_with(".velmora"))
        return FileForm::Snapshot;
    if (name.ends_with(".dlf"))
        return FileForm::DLFLog;
    if (name.ends_with(".gpx"))
        return FileForm::GPX;
    if (name.ends_with(".geojson"))
        return FileForm::GeoJSON;
    if (name.ends_with(".kml"))
        return FileForm::KML;
    if (name.ends_with(".sqlite"))
        return FileForm::Database;
    return std::nullopt;
}

Result<bool> convertMessages(MessageReader& reader, const Conversion& conversion, int descriptor,
                             WorkContext& context) {
    if (conversion.form == FileForm::Database)
        return convertToDatabase(reader, conversion, context);
    if (isTrack(conversion.form))
        return convertToTrack(reader, conversion, descriptor, context);
    if (conversion.form == FileForm::Recording)
        return toRecording(reader, conversion, descriptor);
    std::uint64_t sentences = 0;
    reader.setSentences([&sentences](const PositionSentence&) { ++sentences; });
    Result<bool> converted = conversion.form == FileForm::DLFLog
                                 ? toDLFLog(reader, conversion, descriptor)
                                 : toSnapshot(reader, conversion, descriptor, context);
    reader.setSentences({});
    if (converted && sentences > 0)
        report(conversion.title + ": left out " + std::to_string(sentences) + " sentences of positions: " +
               (conversion.form == FileForm::DLFLog ? "a DLF log" : "a snapshot") + " has none");
    return converted;
}

} // namespace velmora

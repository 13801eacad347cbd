// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Playback/PlaybackFixture.h"

#include "Model/Snapshot.h"
#include "Platform/Linux/Files/FileDescriptor.h"
#include "PropertyLists/PropertyList.h"
#include "Recording/OpenMessages.h"
#include "Recording/Pcapng/PcapngWriter.h"
#include "Tools/Convert/Conversion.h"
#include "Tools/Decode/Decoding.h"
#include "Tools/Decode/FinalDisplay.h"
#include "Tools/Report.h"

#include <fstream>
#include <stdexcept>

#include <sys/mman.h>
#include <unistd.h>

namespace velmora {

namespace {

template <class T>
T valueOf(Result<T> result) {
    if (!result)
        throw std::runtime_error(result.reason());
    return *std::move(result);
}

class DisplayOnly final : public DecodingObserver {
    [[nodiscard]] bool wantsEveryRefresh() const override { return false; }
};

TimeRange upTo(std::optional<Time> to) {
    TimeRange range;
    if (to)
        range.to = TimeBound{to->time_since_epoch()};
    return range;
}

} // namespace

std::vector<DriveMessage> driveOf(const char* scenario, std::size_t messages) {
    const std::unique_ptr<Scenario> drive = scenarioKindNamed(scenario)->make(1);
    std::vector<DriveMessage> all;
    while (all.size() < messages) {
        const ScenarioEvent event = drive->next();
        all.push_back({FakeClock::defaultNow() + event.offset, event.message});
    }
    return all;
}

PlaybackTest::PlaybackTest() {
    for (const DecodedTechnology& technology : decodedTechnologies)
        if (*technology.resource)
            _resources.put(technology.resource, "plist",
                           shippedResource(std::string(technology.resource) + ".plist"));
}

void PlaybackTest::write(const std::string& name, const char* scenario,
                         const std::vector<DriveMessage>& messages) const {
    const auto writer =
        valueOf(PcapngWriter::create(path(name), scenarioKindNamed(scenario)->make(1)->technology()));
    for (const DriveMessage& each : messages)
        valueOf(writer->append(each.time, each.message.bytes()));
    valueOf(writer->close());
}

void PlaybackTest::writeBytes(const std::string& name, const Data& bytes) const {
    const Bytes all = bytes.bytes();
    std::ofstream(path(name), std::ios::binary)
        .write(reinterpret_cast<const char*>(all.data()), static_cast<std::streamsize>(all.size()));
}

OpenedRecording PlaybackTest::open(const std::string& name, const std::string& technology,
                                   RecordingIndex::Limits limits) const {
    OpenedRecording opened;
    opened.file = valueOf(PlayedFile::open(path(name)));
    opened.index = valueOf(RecordingIndex::make(*opened.file, technology, {}, limits));
    opened.player = valueOf(Player::make(*opened.file, *opened.index, {}));
    return opened;
}

OpenedRecording PlaybackTest::openAll(const std::string& name, const std::string& technology,
                                      RecordingIndex::Limits limits) const {
    OpenedRecording opened = open(name, technology, limits);
    while (opened.index->read(1000)) {
    }
    return opened;
}

std::string PlaybackTest::decoded(const std::string& name, std::optional<Time> to,
                                  const std::string& technology) const {
    const auto reader = valueOf(openMessages(path(name)));
    DecodingRequest request;
    request.technology = technology;
    request.technologies = technologiesOf(path(name));
    request.messages.range = upTo(to);
    WorkContext context(name);
    DisplayOnly observer;
    return FinalDisplay::json(
        valueOf(decodeMessages(*reader, request, context, observer)).technologies.front());
}

std::string PlaybackTest::snapshot(const std::string& name, std::optional<Time> to) const {
    const auto reader = valueOf(openMessages(path(name)));
    Conversion conversion;
    conversion.form = FileForm::Snapshot;
    conversion.title = name;
    conversion.messages.range = upTo(to);
    const FileDescriptor output(::memfd_create("snapshot", MFD_CLOEXEC));
    WorkContext context(name);
    static_cast<void>(valueOf(convertMessages(*reader, conversion, output.get(), context)));
    std::string content(static_cast<std::size_t>(::lseek(output.get(), 0, SEEK_END)), '\0');
    if (::pread(output.get(), content.data(), content.size(), 0) != static_cast<ssize_t>(content.size()))
        throw std::runtime_error("cannot read the snapshot");
    return content;
}

std::string PlaybackTest::shown(OpenedRecording& opened) {
    Decoded decoded;
    decoded.technology = opened.index->technology();
    decoded.messages = opened.player->position();
    decoded.display = opened.player->display();
    return FinalDisplay::json(decoded);
}

std::string PlaybackTest::saved(const OpenedRecording& opened) {
    const Player::Saved saved = opened.player->saved();
    return valueOf(writePropertyList(makeSnapshot(saved.refresh.value(), saved.contents, {})));
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Data/MarkedCopy.h"

#include "Export/Masking/MaskedRecording.h"
#include "Export/Masking/MessageMask.h"
#include "Platform/Linux/Errno.h"
#include "Platform/Linux/Files/AtomicFile.h"
#include "Recording/Files/DescriptorFile.h"
#include "Recording/OpenMessages.h"
#include "Recording/Pcapng/PcapngReader.h"
#include "Recording/Pcapng/PcapngWriter.h"
#include "Recording/Pcapng/RecordingCopy.h"

#include <cerrno>
#include <filesystem>
#include <memory>
#include <span>
#include <system_error>
#include <vector>

#include <fcntl.h>

namespace velmora {

namespace {

constexpr mode_t newFileMode = 0600;

} // namespace

/// Calls `add` with each message of the range and its notes.
template <class Add>
Result<std::uint64_t> MarkedCopy::copyMessages(MessageReader& reader, Add add) const {
    reader.setReadsAllTechnologies(true);
    std::uint64_t position = 0;
    std::uint64_t written = 0;
    while (position <= last) {
        const std::optional<LoggedMessage> message = reader.next();
        if (!message)
            break;
        const std::vector<std::string> technologies = reader.technologies();
        // A file that names no technology, or that is shown as another, has one.
        if (technologies.size() > 1 && technologies[message->technology] != technology)
            continue;
        if (position >= first) {
            std::vector<std::string> comments;
            if (const auto note = notes.find(position); note != notes.end())
                comments.push_back(note->second);
            if (const Result<Done> added = add(*message, comments); !added)
                return Failure{added.reason()};
            ++written;
        }
        ++position;
    }
    if (reader.failure())
        return Failure{reader.failure()->reason};
    return written;
}

Result<std::uint64_t> MarkedCopy::writeMasked(MessageReader& reader, int descriptor) const {
    MessageMask mask(*masking);
    MaskedRecording recording(std::make_unique<DescriptorFile>(descriptor, false), output,
                              {masking->level, masking->key.fingerprint(), {}});
    recording.addSentencesOf(reader);
    Result<std::uint64_t> written = copyMessages(
        reader, [&](const LoggedMessage& message, std::span<const std::string> comments) -> Result<Done> {
            const std::optional<LoggedMessage> masked = mask.mask(message, technology);
            return masked ? recording.add(masked->time, masked->message.bytes(), technology, comments)
                          : Result<Done>(Done{});
        });
    if (const Result<Done> finished = recording.finish(technology); written && !finished)
        return Failure{finished.reason()};
    return written;
}

Result<std::uint64_t> MarkedCopy::writeTo(int descriptor) const {
    const Result<std::unique_ptr<MessageReader>> reader = openMessages(input);
    if (!reader)
        return Failure{reader.reason()};
    if (masking)
        return writeMasked(**reader, descriptor);
    if (auto* const recording = dynamic_cast<PcapngReader*>(reader->get())) {
        RecordingCopy copy(*recording, std::make_unique<DescriptorFile>(descriptor, false), output,
                           {.technology = {}, .only = {}});
        Result<std::uint64_t> written =
            copyMessages(*recording, [&copy](const LoggedMessage&, std::span<const std::string> comments) {
                return copy.addMessage(comments);
            });
        if (const Result<Done> finished = copy.finish(); written && !finished)
            return Failure{finished.reason()};
        return written;
    }
    const int own = ::fcntl(descriptor, F_DUPFD_CLOEXEC, 0);
    if (own < 0)
        return Failure{errnoText(errno)};
    const Result<std::unique_ptr<PcapngWriter>> writer = PcapngWriter::adopt(own, output, technology);
    if (!writer)
        return Failure{writer.reason()};
    Result<std::uint64_t> written = copyMessages(
        **reader, [&writer](const LoggedMessage& message, std::span<const std::string> comments) {
            return (*writer)->append(message.time, message.message.bytes(), comments);
        });
    if (const Result<Done> closed = (*writer)->close(); written && !closed)
        return Failure{closed.reason()};
    return written;
}

Result<std::uint64_t> MarkedCopy::write() const {
    // The input is there, too.
    if (std::error_code error; std::filesystem::exists(output, error))
        return Failure{output + " is there already; nothing is overwritten"};
    Result<AtomicFile> file = AtomicFile::create(output, newFileMode);
    if (!file)
        return Failure{output + ": " + file.reason()};
    Result<std::uint64_t> written = writeTo(file->descriptor());
    if (!written)
        return written;
    if (const Result<Done> committed = file->commit(AtomicFile::IfExists::Refuse); !committed)
        return Failure{output + ": " + committed.reason()};
    return written;
}

} // namespace velmora

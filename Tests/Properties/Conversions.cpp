// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Properties/Conversions.h"

#include "Platform/Linux/Files/FileDescriptor.h"
#include "Recording/OpenMessages.h"
#include "Recording/Pcapng/PcapngWriter.h"
#include "Recording/Refreshes/RefreshTicks.h"
#include "Tests/Recording/FakeRecordingFile.h"
#include "Tests/Recording/PcapngFile.h"
#include "Tools/Report.h"

#include <memory>
#include <stdexcept>

#include <sys/mman.h>
#include <unistd.h>

namespace velmora {

namespace {

std::unique_ptr<MessageReader> open(const Data& file) {
    auto reader = openMessages(ChunkedInput(std::make_unique<MemorySource>(file)));
    if (!reader)
        throw std::runtime_error(reader.reason());
    return *std::move(reader);
}

void expectComplete(const MessageReader& reader) {
    if (reader.failure())
        throw std::runtime_error(reader.failure()->reason);
    if (!reader.losses().empty())
        throw std::runtime_error(describe(reader.losses().front()));
}

Data contentOf(int descriptor) {
    std::vector<std::uint8_t> content(static_cast<std::size_t>(::lseek(descriptor, 0, SEEK_END)));
    if (::pread(descriptor, content.data(), content.size(), 0) != static_cast<ssize_t>(content.size()))
        throw std::runtime_error("cannot read the converted file");
    return Data(std::move(content));
}

} // namespace

Data recordingOf(const std::vector<GivenMessage>& messages, const std::string& technology) {
    FakeOutputFile medium;
    {
        const auto writer =
            PcapngWriter::start(std::make_unique<FakeRecordingFile>(medium), "the recording", technology);
        if (!writer)
            throw std::runtime_error(writer.reason());
        for (const GivenMessage& each : messages)
            if (const auto appended = (*writer)->append(each.time, each.message.bytes()); !appended)
                throw std::runtime_error(appended.reason());
        if (const auto closed = (*writer)->close(); !closed)
            throw std::runtime_error(closed.reason());
    }
    return Data(std::move(medium.content));
}

Data converted(const Data& file, FileForm form, const std::string& technology) {
    Conversion conversion;
    conversion.form = form;
    conversion.title = "the input";
    conversion.name = "the output";
    // Of a recording, an override is a change.
    const std::unique_ptr<MessageReader> reader = open(file);
    if (reader->form() != "recording")
        conversion.technology = technology;
    const FileDescriptor output(::memfd_create("converted", MFD_CLOEXEC));
    WorkContext context(conversion.title);
    const Result<bool> complete = convertMessages(*reader, conversion, output.get(), context);
    if (!complete)
        throw std::runtime_error(complete.reason());
    if (!*complete)
        throw std::runtime_error("some message was left out");
    expectComplete(*reader);
    return contentOf(output.get());
}

std::vector<GivenMessage> messagesOf(const Data& file) {
    const std::unique_ptr<MessageReader> reader = open(file);
    std::vector<GivenMessage> messages;
    while (const auto message = reader->next())
        messages.push_back({message->time, Data::copyOf(message->message.bytes())});
    expectComplete(*reader);
    return messages;
}

std::vector<Data> bytesOf(const std::vector<GivenMessage>& messages) {
    std::vector<Data> all;
    for (const GivenMessage& each : messages)
        all.push_back(each.message);
    return all;
}

std::vector<std::vector<Data>> lastRefreshes(const std::vector<GivenMessage>& messages) {
    constexpr std::ptrdiff_t kept = 5;
    std::vector<std::vector<Data>> refreshes;
    RefreshTicks ticks;
    for (const GivenMessage& each : messages) {
        if (ticks.tickBefore(each.time) || refreshes.empty())
            refreshes.emplace_back();
        refreshes.back().push_back(each.message);
    }
    if (std::ssize(refreshes) > kept)
        refreshes.erase(refreshes.begin(), refreshes.end() - kept);
    return refreshes;
}

} // namespace velmora

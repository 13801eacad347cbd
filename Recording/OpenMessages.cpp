// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/OpenMessages.h"

#include "Recording/DLF/DLFReader.h"
#include "Recording/Files/FileSource.h"
#include "Recording/Files/GzipSource.h"
#include "Recording/Pcapng/PcapngReader.h"
#include "Recording/Snapshots/SnapshotReader.h"

#include <algorithm>
#include <filesystem>
#include <string_view>
#include <system_error>
#include <utility>

namespace velmora {

namespace {

bool startsWith(Bytes bytes, std::string_view text) {
    return bytes.size() >= text.size() &&
           std::equal(text.begin(), text.end(), bytes.begin(),
                      [](char c, std::uint8_t byte) { return static_cast<std::uint8_t>(c) == byte; });
}

/// The start of a property list: the binary form's signature, or the beginning of an XML document.
bool isPropertyList(Bytes begin) {
    if (startsWith(begin, "\xEF\xBB\xBF"))
        begin = begin.subspan(3);
    constexpr std::string_view white = " \t\r\n";
    while (!begin.empty() && white.find(static_cast<char>(begin[0])) != white.npos)
        begin = begin.subspan(1);
    for (const std::string_view mark : {"bplist", "<?xml", "<!--", "<!DOCTYPE", "<plist", "<dict"}) {
        if (startsWith(begin, mark))
            return true;
    }
    return false;
}

/// A capture file of the older format, in either byte order, with microseconds or nanoseconds.
bool isClassicCapture(Bytes begin) {
    for (const std::string_view magic :
         {"\xA1\xB2\xC3\xD4", "\xD4\xC3\xB2\xA1", "\xA1\xB2\x3C\x4D", "\x4D\x3C\xB2\xA1"})
        if (startsWith(begin, magic))
            return true;
    return false;
}

template <class Reader>
Result<std::unique_ptr<MessageReader>> generalized(Result<std::unique_ptr<Reader>> reader) {
    if (!reader)
        return Failure{reader.reason()};
    return std::unique_ptr<MessageReader>(*std::move(reader));
}

Result<std::unique_ptr<MessageReader>> openUnpacked(ChunkedInput input) {
    // Reads no more than the decision needs: on a pipe more may take a while to arrive.
    constexpr std::string_view sectionHeader = "\n\r\r\n";
    static_cast<void>(input.ensure(sectionHeader.size()));
    if (startsWith(input.available(), sectionHeader))
        return generalized(PcapngReader::open(std::move(input)));
    if (isClassicCapture(input.available()))
        return Failure{
            "classic pcap file, wanted pcapng; this converts it: editcap -F pcapng IN.pcap OUT.pcapng"};
    constexpr std::size_t longestWhiteSpace = 256;
    static_cast<void>(input.ensure(longestWhiteSpace));
    if (isPropertyList(input.available()))
        return generalized(SnapshotReader::open(std::move(input)));
    return generalized(DLFReader::open(std::move(input), "a recording, a snapshot or a DLF log"));
}

} // namespace

Result<std::unique_ptr<MessageReader>> openMessages(const std::string& path, FileSource::Hooks hooks) {
    Result<std::unique_ptr<ByteSource>> source = FileSource::open(path, std::move(hooks));
    if (!source)
        return Failure{source.reason()};
    return openMessages(ChunkedInput(*std::move(source)));
}

Result<std::unique_ptr<MessageReader>> openMessages(ChunkedInput input) {
    constexpr std::size_t gzipStart = 4;
    static_cast<void>(input.ensure(gzipStart));
    if (!isGzip(input.available()))
        return openUnpacked(std::move(input));
    Result<std::unique_ptr<MessageReader>> reader =
        openUnpacked(ChunkedInput(std::make_unique<GzipSource>(std::move(input))));
    if (reader)
        (*reader)->setCompressed();
    return reader;
}

std::vector<std::string> technologiesOf(const std::string& path) {
    std::error_code error;
    if (path == "-" || !std::filesystem::is_regular_file(path, error))
        return {};
    const Result<std::unique_ptr<MessageReader>> reader = openMessages(path);
    if (!reader)
        return {};
    // A DLF log has one technology, which opening it has derived; any other file may name one at its end.
    if (!dynamic_cast<const DLFReader*>(reader->get())) {
        (*reader)->setReadsAllTechnologies(true);
        while ((*reader)->next()) {
        }
    }
    std::vector<std::string> names = (*reader)->technologies();
    std::erase(names, std::string());
    return names;
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Playback/PlayedFile.h"

#include "Recording/OpenMessages.h"

#include <algorithm>
#include <utility>

namespace velmora {

namespace {

/// Counts what is read.
class CountedSource final : public ByteSource {
public:
    CountedSource(std::unique_ptr<ByteSource> source, std::shared_ptr<std::uint64_t> count)
        : _source(std::move(source)), _count(std::move(count)) {}

    Result<std::size_t> read(std::span<std::uint8_t> buffer) override {
        Result<std::size_t> count = _source->read(buffer);
        if (count)
            *_count += *count;
        return count;
    }

private:
    std::unique_ptr<ByteSource> _source;
    std::shared_ptr<std::uint64_t> _count;
};

} // namespace

Result<std::unique_ptr<PlayedFile>> PlayedFile::open(const std::string& path, Wrapping wrapping) {
    Result<std::shared_ptr<SharedFile>> file = SharedFile::open(path);
    if (!file)
        return Failure{file.reason()};
    std::unique_ptr<PlayedFile> played(new PlayedFile(path, *std::move(file), std::move(wrapping)));
    Result<std::unique_ptr<MessageReader>> reader = openMessages(ChunkedInput(
        std::make_unique<CountedSource>(SharedFile::from(played->_file, 0), played->_bytesRead)));
    if (!reader)
        return Failure{reader.reason()};
    played->_reader = *std::move(reader);
    played->_reader->setReadsAllTechnologies(true);
    if (!played->_reader->isCompressed())
        played->_recording = dynamic_cast<PcapngReader*>(played->_reader.get());
    if (played->_wrapping)
        played->_reader = played->_wrapping(std::move(played->_reader));
    if (played->_recording)
        return played;
    Result<std::unique_ptr<MessageSpool>> spool = MessageSpool::create();
    if (!spool)
        return Failure{spool.reason()};
    played->_spool = *std::move(spool);
    return played;
}

std::optional<LoggedMessage> PlayedFile::next() {
    if (!_spoolFailure.empty())
        return std::nullopt;
    std::optional<LoggedMessage> message = _reader->next();
    if (message && _spool)
        if (const Result<Done> kept = _spool->append(*message); !kept) {
            _spoolFailure = kept.reason();
            return std::nullopt;
        }
    return message;
}

MessagePlace PlayedFile::place() const {
    MessagePlace place;
    if (_recording)
        place.recording = std::make_shared<const PcapngReader::Place>(_recording->place());
    else
        place.spooled = _spool->end();
    return place;
}

std::string PlayedFile::failure() const {
    if (!_spoolFailure.empty())
        return _spoolFailure;
    return _reader->failure() ? _reader->failure()->reason : std::string();
}

Result<std::unique_ptr<MessageReader>> PlayedFile::from(const MessagePlace& place) const {
    if (!place.recording)
        return _spool->from(place.spooled);
    const std::uint64_t offset = place.recording->offset;
    std::unique_ptr<MessageReader> reader = PcapngReader::resume(
        ChunkedInput(SharedFile::from(_file, offset), ChunkedInput::defaultChunkSize, offset),
        *place.recording);
    reader->setReadsAllTechnologies(true);
    return _wrapping ? _wrapping(std::move(reader)) : std::move(reader);
}

double PlayedFile::progress() const {
    return _file->size() == 0
               ? 1
               : std::min(1.0, static_cast<double>(*_bytesRead) / static_cast<double>(_file->size()));
}

} // namespace velmora

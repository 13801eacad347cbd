// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Pcapng/PcapngWriter.h"

#include "Platform/TelephonyService.h"
#include "Recording/Files/DescriptorFile.h"
#include "Recording/MessageReader.h"
#include "Recording/Positions/NMEAWriter.h"

#include <algorithm>
#include <cerrno>
#include <system_error>
#include <utility>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace velmora {

namespace {

constexpr std::size_t flushThreshold = std::size_t{64} << 10;
constexpr std::size_t maximumTechnology = 255;

bool isTemporary(int error) {
    constexpr int passing[] = {ENOSPC, EDQUOT, EFBIG, EIO, EROFS};
    return std::find(std::begin(passing), std::end(passing), error) != std::end(passing);
}

} // namespace

Result<std::unique_ptr<PcapngWriter>> PcapngWriter::create(const std::string& path,
                                                           std::string_view technology, Positions positions) {
    if (path == "-")
        return start(std::make_unique<DescriptorFile>(STDOUT_FILENO, false), "standard output", technology,
                     positions);
    const int descriptor = ::open(path.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, S_IRUSR | S_IWUSR);
    if (descriptor < 0)
        return Failure{"cannot create " + path + ": " + std::generic_category().message(errno)};
    return adopt(descriptor, path, technology, positions);
}

Result<std::unique_ptr<PcapngWriter>> PcapngWriter::adopt(int descriptor, std::string name,
                                                          std::string_view technology, Positions positions) {
    return start(std::make_unique<DescriptorFile>(descriptor, true), std::move(name), technology, positions);
}

Result<std::unique_ptr<PcapngWriter>> PcapngWriter::start(std::unique_ptr<OutputFile> file, std::string name,
                                                          std::string_view technology, Positions positions) {
    std::unique_ptr<PcapngWriter> writer(new PcapngWriter(std::move(file), std::move(name)));
    const std::string_view shortName = shortTechnologyName(technology);
    if (shortName.size() > maximumTechnology)
        return Failure{"technology name of " + std::to_string(shortName.size()) + " bytes, wanted at most " +
                       std::to_string(maximumTechnology)};
    pcapngBlocks::appendSection(writer->_head);
    pcapngBlocks::appendInterface(writer->_head, shortName);
    if (positions == Positions::With)
        pcapngBlocks::appendPositionInterface(writer->_head);
    writer->_buffer = writer->_head;
    writer->_buffer.reserve(2 * flushThreshold);
    if (const Result<Done> written = writer->flush(); !written && !writer->hasTemporaryError())
        return Failure{written.reason()};
    return writer;
}

PcapngWriter::PcapngWriter(std::unique_ptr<OutputFile> file, std::string name)
    : _file(std::move(file)), _name(std::move(name)) {}

PcapngWriter::~PcapngWriter() {
    const Result<Done> closed = close();
    static_cast<void>(closed); // callers that need the result call close themselves
}

Result<Done> PcapngWriter::append(Time time, Bytes message, std::span<const std::string> comments) {
    if (_permanentError)
        return *_permanentError;
    if (message.size() > maximumMessageSize)
        return Failure{"message of " + std::to_string(message.size()) + " bytes, wanted at most " +
                       std::to_string(maximumMessageSize)};
    if (!makeRoom(pcapngBlocks::packetSize(message.size(), comments))) {
        _dropped += _dropping ? 1 : 0;
        return outcome();
    }
    pcapngBlocks::appendPacket(_buffer, time, message, 0, comments);
    ++_messages;
    return _temporaryError || waiting().size() < flushThreshold ? outcome() : flush();
}

Result<Done> PcapngWriter::appendSentence(Time time, std::string_view sentence) {
    const Bytes text(reinterpret_cast<const std::uint8_t*>(sentence.data()), sentence.size());
    if (_permanentError || !makeRoom(pcapngBlocks::packetSize(text.size())))
        return outcome();
    pcapngBlocks::appendPacket(_buffer, time, text, 1);
    return _temporaryError || waiting().size() < flushThreshold ? outcome() : flush();
}

Result<Done> PcapngWriter::appendFix(const Fix& fix) {
    for (const std::string& sentence : nmeaSentences(fix))
        if (Result<Done> appended = appendSentence(fix.time, sentence); !appended)
            return appended;
    return outcome();
}

bool PcapngWriter::makeRoom(std::size_t length) {
    // What has been gathered goes out ahead of a long message, so that the buffer need not hold both.
    if (!_temporaryError && !waiting().empty() && waiting().size() + length > 2 * flushThreshold) {
        if (const Result<Done> written = flush(); !written && !_temporaryError)
            return false;
    }
    _dropping = _dropping || (_temporaryError && waiting().size() + length > maximumQueue);
    return !_dropping;
}

Result<Done> PcapngWriter::flush() {
    if (_permanentError)
        return *_permanentError;
    if (_change.kind != OutputFile::Change::Kind::None || (!_temporaryError && noteChange()))
        return outcome();
    // What a temporary failure has left after the last complete block is cut off first.
    if (const int error = _temporaryError ? _file->truncateTo(_end) : 0; error != 0) {
        noteFailure("write", error);
        return outcome();
    }
    for (Bytes rest = waiting(); !rest.empty();) {
        const OutputFile::Written written = _file->write(rest);
        if (written.error != 0) {
            noteFailure("write", written.error);
            return outcome();
        }
        _end += written.bytes;
        rest = rest.subspan(written.bytes);
    }
    // Nothing is discarded before it is known to be where it belongs.
    if (noteChange())
        return outcome();
    _temporaryError.reset();
    _dropping = false;
    if (!_keepsUnsynced || written() > maximumUnsynced)
        discardFront(written());
    return Done{};
}

Result<Done> PcapngWriter::sync() {
    _keepsUnsynced = _file->isRegular();
    // A sync that failed is retried by the next call, so that this one returns the failure.
    if (!collectSync())
        return outcome();
    if (Result<Done> flushed = flush(); !flushed)
        return flushed;
    if (_keepsUnsynced && !_syncIsUnderWay && _synced < _end) {
        _file->startSync();
        _syncIsUnderWay = true;
        _syncing = _end;
    }
    return Done{};
}

Result<Done> PcapngWriter::continueIn(std::unique_ptr<OutputFile> file, std::string name) {
    static_cast<void>(_file->close()); // what it may report is in the new file, or was in the old one
    std::size_t kept = pcapngBlocks::completeBlocks(_buffer, intactInBuffer());
    if (_base < _head.size())
        kept = std::max(kept, static_cast<std::size_t>(_head.size() - _base));
    _buffer.erase(_buffer.begin(), _buffer.begin() + static_cast<std::ptrdiff_t>(kept));
    _messagesBefore = _messages - pcapngBlocks::countPackets(_buffer).messages;
    _buffer.insert(_buffer.begin(), _head.begin(), _head.end());
    _base = _end = _syncing = _synced = 0;
    _syncIsUnderWay = false;
    _change = {};
    _temporaryError.reset();
    _file = std::move(file);
    _name = std::move(name);
    return flush();
}

Result<Done> PcapngWriter::close() {
    if (!_file)
        return outcome();
    Result<Done> flushed = flush();
    // Where all that was not synced has been kept, it is retried once.
    if (flushed && _file->isRegular() && !syncNow() && _base == _synced && (flushed = flush()))
        static_cast<void>(syncNow());
    if (const int error = _file->close(); error != 0 && outcome())
        _permanentError = failureOf("close", error);
    _file.reset();
    return outcome();
}

pcapngBlocks::PacketCount PcapngWriter::unsaved() const {
    return pcapngBlocks::countPackets(waiting());
}

Result<Done> PcapngWriter::outcome() const {
    if (_permanentError)
        return *_permanentError;
    if (_temporaryError)
        return *_temporaryError;
    return Done{};
}

bool PcapngWriter::collectSync() {
    const std::optional<int> error = _syncIsUnderWay ? _file->takeSyncResult() : std::nullopt;
    if (!error)
        return true;
    _syncIsUnderWay = false;
    return applySyncResult(*error, _syncing);
}

bool PcapngWriter::syncNow() {
    _syncIsUnderWay = false;
    return applySyncResult(_file->sync(), _end);
}

bool PcapngWriter::applySyncResult(int error, std::uint64_t end) {
    // Some file systems cannot sync, and say so with an error that does not count.
    if (isTemporary(error)) {
        // What has not been synced is written again.
        _end = _base;
        noteFailure("write", error);
        return false;
    }
    _synced = end;
    if (end > _base)
        discardFront(static_cast<std::size_t>(end - _base));
    return true;
}

bool PcapngWriter::noteChange() {
    _change = _file->change();
    if (_change.kind == OutputFile::Change::Kind::None)
        return false;
    // What is not in the file any more is not saved.
    _end = std::min(_end, _base + pcapngBlocks::completeBlocks(_buffer, intactInBuffer()));
    _temporaryError = Failure{(_name + " ").append(OutputFile::describe(_change.kind))};
    return true;
}

std::size_t PcapngWriter::intactInBuffer() const {
    return static_cast<std::size_t>(_change.intact - std::min(_change.intact, _base));
}

void PcapngWriter::noteFailure(const char* operation, int error) {
    _end = _base + pcapngBlocks::completeBlocks(_buffer, written());
    const bool passing = isTemporary(error) && _file->isRegular();
    const int cutError = passing ? _file->truncateTo(_end) : 0;
    if (passing && (cutError == 0 || isTemporary(cutError))) {
        _temporaryError = failureOf(operation, error);
        return;
    }
    _temporaryError.reset();
    _permanentError = failureOf(operation, error);
}

Failure PcapngWriter::failureOf(const char* operation, int error) const {
    return Failure{std::string("cannot ") + operation + " " + _name + ": " +
                   std::generic_category().message(error)};
}

void PcapngWriter::discardFront(std::size_t length) {
    _buffer.erase(_buffer.begin(), _buffer.begin() + static_cast<std::ptrdiff_t>(length));
    _base += length;
    if (_buffer.empty() && _buffer.capacity() > maximumUnsynced) { // a long queue's room
        _buffer.shrink_to_fit();
        _buffer.reserve(2 * flushThreshold);
    }
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recorder/RecordingSession.h"

#include "Platform/Linux/Errno.h"
#include "Platform/Linux/Files/AtomicFile.h"
#include "Platform/TelephonyService.h"
#include "Recorder/OverwriteTarget.h"
#include "Recording/Files/DescriptorFile.h"

#include <algorithm>
#include <cerrno>
#include <filesystem>
#include <utility>

#include <fcntl.h>
#include <poll.h>
#include <unistd.h>

namespace velmora {

namespace {

/// For a writer, which closes its descriptor.
Result<std::unique_ptr<DescriptorFile>> secondDescriptor(int descriptor, const std::string& path) {
    const int copy = ::fcntl(descriptor, F_DUPFD_CLOEXEC, 0);
    if (copy < 0)
        return Failure{"cannot write " + path + ": " + errnoText(errno)};
    return std::make_unique<DescriptorFile>(copy, true);
}

} // namespace

Result<std::unique_ptr<RecordingSession>> RecordingSession::open(const std::string& path, bool force) {
    if (path == "-") {
        std::unique_ptr<RecordingSession> session(new RecordingSession({path, {}, false}));
        session->_isLive = !isRegularFile(STDOUT_FILENO);
        return session;
    }
    Result<RecordingFile> file = RecordingFile::open(path, force);
    if (!file)
        return Failure{file.reason()};
    std::unique_ptr<RecordingSession> session(new RecordingSession(*std::move(file)));
    session->_isLive = !session->_file.isRegular();
    return session;
}

RecordingSession::~RecordingSession() {
    _writer.reset();
    removeIfEmpty();
}

Result<Done> RecordingSession::setTechnology(std::string_view technology) {
    const std::string_view name = shortTechnologyName(technology);
    if (_writer && name != _technology)
        return Failure{"the telephony service now speaks " + std::string(name) + ", the recording is of " +
                       _technology};
    if (_writer)
        return Done{};
    Result<std::unique_ptr<PcapngWriter>> writer = startWriter(name);
    if (!writer)
        return Failure{writer.reason()};
    _writer = *std::move(writer);
    _technology = name;
    return keepTemporaryError(_writer->flush()); // the head may be waiting
}

Result<std::unique_ptr<PcapngWriter>> RecordingSession::startWriter(std::string_view technology) {
    if (_file.path == "-")
        return PcapngWriter::create(_file.path, technology, _positions);
    if (_file.isRegular() && !_file.isEmpty())
        return overwriteWith(technology);
    Result<std::unique_ptr<DescriptorFile>> file = secondDescriptor(_file.descriptor.get(), _file.path);
    if (!file)
        return Failure{file.reason()};
    (*file)->watchForChanges(_file.path);
    return PcapngWriter::start(*std::move(file), _file.path, technology, _positions);
}

/// A file that is to be overwritten stays as it is until the new one has its head.
Result<std::unique_ptr<PcapngWriter>> RecordingSession::overwriteWith(std::string_view technology) {
    const Result<std::filesystem::path> target = overwriteTarget(_file.path);
    if (!target)
        return Failure{target.reason()};
    Result<AtomicFile> made = AtomicFile::create(*target, RecordingFile::newFileMode);
    if (!made)
        return Failure{_file.path + ": " + made.reason()};
    static_cast<void>(lockRecording(made->descriptor())); // before it has a name that others know
    Result<std::unique_ptr<DescriptorFile>> file = secondDescriptor(made->descriptor(), _file.path);
    if (!file)
        return Failure{file.reason()};
    DescriptorFile& written = **file;
    Result<std::unique_ptr<PcapngWriter>> writer =
        PcapngWriter::start(*std::move(file), _file.path, technology, _positions);
    if (!writer)
        return writer;
    if (const Result<Done> head = (*writer)->flush(); !head) // it may be waiting
        return Failure{head.reason()};
    if (const Result<Done> committed = made->commit(AtomicFile::IfExists::Replace); !committed)
        return Failure{_file.path + ": " + committed.reason()};
    written.watchForChanges(_file.path);
    _file.descriptor.reset(); // the old one, which was locked until now
    return writer;
}

Result<Done> RecordingSession::append(Time time, Bytes message) {
    const std::uint64_t before = _writer->messages();
    Result<Done> appended = _writer->append(time, message, _notes);
    if (_writer->messages() != before) {
        _bytes += message.size();
        _notes.clear();
    }
    return keepTemporaryError(std::move(appended));
}

Result<Done> RecordingSession::appendSentence(Time time, std::string_view sentence) {
    if (!_writer)
        return Done{};
    ++_sentences;
    return keepTemporaryError(_writer->appendSentence(time, sentence));
}

void RecordingSession::note(std::string text) {
    std::size_t length = std::min(text.size(), longestNote);
    // Not within a character.
    while (length < text.size() && length > 0 && (static_cast<std::uint8_t>(text[length]) & 0xC0) == 0x80)
        --length;
    text.resize(length);
    _notes.push_back(std::move(text));
}

Result<Done> RecordingSession::save() {
    if (_writer)
        return keepTemporaryError(_writer->sync());
    // What is overwritten may be changed by others until it is.
    const OutputFile::Change change =
        _file.isCreated ? changeOf(_file.descriptor.get(), _file.path, 0, 0) : OutputFile::Change();
    return change.kind == OutputFile::Change::Kind::None ? Done{} : moveOn(change.kind);
}

/// Continues in a file beside the one that others have changed; a failure to create it is a temporary error.
Result<Done> RecordingSession::moveOn(OutputFile::Change::Kind change) {
    const std::string what = (_file.path + " ").append(OutputFile::describe(change));
    Result<RecordingFile> beside = RecordingFile::createBeside(_path);
    Result<std::unique_ptr<DescriptorFile>> file =
        beside ? secondDescriptor(beside->descriptor.get(), beside->path) : Failure{beside.reason()};
    if (!file) {
        _temporaryError = what + ", and " + file.reason();
        return Done{};
    }
    _temporaryError.clear();
    _file = *std::move(beside);
    _moves.push_back({what, _file.path});
    if (!_writer)
        return Done{};
    (*file)->watchForChanges(_file.path);
    Result<Done> result = _writer->continueIn(*std::move(file), _file.path);
    if (!_messagesBeforeMove)
        _messagesBeforeMove = _writer->messages() - _writer->messagesOfFile();
    return keepTemporaryError(std::move(result));
}

Result<Done> RecordingSession::keepTemporaryError(Result<Done> result) {
    if (_writer->change() != OutputFile::Change::Kind::None)
        return moveOn(_writer->change());
    const bool waiting = _writer->hasTemporaryError();
    if (!waiting)
        _temporaryError.clear();
    else if (!result)
        _temporaryError = result.reason();
    return waiting ? Result<Done>(Done{}) : std::move(result);
}

Result<Done> RecordingSession::close() {
    if (!_writer)
        return Done{};
    // The file may have been changed since the last save.
    static_cast<void>(keepTemporaryError(_writer->flush()));
    return _writer->close();
}

bool RecordingSession::hasClosedReader() const {
    pollfd watched{STDOUT_FILENO, 0, 0};
    return _file.path == "-" && ::poll(&watched, 1, 0) > 0 && (watched.revents & POLLERR) != 0;
}

} // namespace velmora

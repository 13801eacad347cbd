// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Record/RecordingSession.h"

#include "Platform/Linux/Files/AtomicFile.h"
#include "Platform/TelephonyService.h"
#include "Tools/Report.h"

#include <cerrno>
#include <filesystem>
#include <system_error>
#include <utility>

#include <fcntl.h>
#include <poll.h>
#include <sys/stat.h>
#include <unistd.h>

namespace velmora {

namespace {

constexpr mode_t newFileMode = 0666;

bool isRegularFile(int descriptor) {
    struct stat status = {};
    return ::fstat(descriptor, &status) == 0 && S_ISREG(status.st_mode);
}

bool isFilledFile(int descriptor) {
    struct stat status = {};
    return ::fstat(descriptor, &status) == 0 && S_ISREG(status.st_mode) && status.st_size > 0;
}

} // namespace

Result<std::unique_ptr<RecordingSession>> RecordingSession::open(const std::string& path, bool force) {
    std::unique_ptr<RecordingSession> session(new RecordingSession(path));
    if (path == "-") {
        session->_isLive = !isRegularFile(STDOUT_FILENO);
        return session;
    }
    session->_file =
        FileDescriptor(::open(path.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, newFileMode));
    session->_created = session->_file.get() >= 0;
    if (!session->_created && errno == EEXIST) {
        session->_file = FileDescriptor(::open(path.c_str(), O_WRONLY | O_CLOEXEC));
        if (session->_file.get() >= 0 && isRegularFile(session->_file.get()) && !force)
            return Failure{fileExistsMessage(path)};
    }
    if (session->_file.get() < 0)
        return Failure{"cannot create " + path + ": " + std::generic_category().message(errno)};
    session->_isLive = !isRegularFile(session->_file.get());
    return session;
}

RecordingSession::~RecordingSession() {
    _writer.reset();
    removeIfEmpty();
}

void RecordingSession::removeIfEmpty() const {
    struct stat status = {};
    if (_created && ::stat(_path.c_str(), &status) == 0 && S_ISREG(status.st_mode) && status.st_size == 0)
        ::unlink(_path.c_str());
}

Result<Done> RecordingSession::setTechnology(std::string_view technology) {
    const std::string_view name = shortTechnologyName(technology);
    if (_writer && name != _technology)
        return Failure{"the telephony service now speaks " + std::string(name) + ", the recording is of " +
                       _technology};
    if (_writer)
        return Done{};
    // A file that is to be overwritten stays as it is until the new one has its head.
    std::optional<AtomicFile> file;
    if (isFilledFile(_file.get())) {
        std::error_code error;
        std::filesystem::path place = std::filesystem::canonical(_path, error); // a symbolic link stays one
        if (error)
            place = _path;
        Result<AtomicFile> made = AtomicFile::create(place, newFileMode);
        if (!made)
            return Failure{_path + ": " + made.reason()};
        file.emplace(*std::move(made));
    }
    // The writer closes its descriptor, and so gets one of its own.
    const int descriptor = file ? file->descriptor() : _file.get();
    const int copy = _path == "-" ? -1 : ::fcntl(descriptor, F_DUPFD_CLOEXEC, 0);
    if (_path != "-" && copy < 0)
        return Failure{"cannot write " + _path + ": " + std::generic_category().message(errno)};
    Result<std::unique_ptr<PcapngWriter>> writer =
        _path == "-" ? PcapngWriter::create(_path, name) : PcapngWriter::adopt(copy, _path, name);
    _file.reset();
    if (!writer)
        return Failure{writer.reason()};
    if (file) {
        if (Result<Done> written = (*writer)->flush(); !written) // the head may be waiting
            return written;
        if (const Result<Done> committed = file->commit(AtomicFile::IfExists::Replace); !committed)
            return Failure{_path + ": " + committed.reason()};
    }
    _writer = *std::move(writer);
    _technology = name;
    return keepTemporaryError(_writer->flush()); // the head may be waiting
}

Result<Done> RecordingSession::append(Time time, Bytes message) {
    const std::uint64_t before = _writer->messages();
    Result<Done> appended = _writer->append(time, message);
    if (_writer->messages() != before)
        _bytes += message.size();
    return keepTemporaryError(std::move(appended));
}

Result<Done> RecordingSession::save() {
    if (!_writer)
        return Done{};
    return keepTemporaryError(_writer->sync());
}

Result<Done> RecordingSession::keepTemporaryError(Result<Done> result) {
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
    return _writer->close();
}

bool RecordingSession::hasClosedReader() const {
    pollfd watched{STDOUT_FILENO, 0, 0};
    return _path == "-" && ::poll(&watched, 1, 0) > 0 && (watched.revents & POLLERR) != 0;
}

} // namespace velmora

#include "Tools/RecordingSession.h"

#include "Platform/TelephonyService.h"

#include <cerrno>
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

} // namespace

Result<std::unique_ptr<RecordingSession>> RecordingSession::open(const std::string& path, bool force) {
    std::unique_ptr<RecordingSession> session(new RecordingSession(path));
    if (path == "-")
        return session;
    session->_file =
        FileDescriptor(::open(path.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, newFileMode));
    session->_created = session->_file.get() >= 0;
    if (!session->_created && errno == EEXIST) {
        session->_file = FileDescriptor(::open(path.c_str(), O_WRONLY | O_CLOEXEC));
        if (session->_file.get() >= 0 && isRegularFile(session->_file.get()) && !force)
            return Failure{path + " is there already; --force overwrites it"};
    }
    if (session->_file.get() < 0)
        return Failure{"cannot create " + path + ": " + std::generic_category().message(errno)};
    return session;
}

RecordingSession::~RecordingSession() {
    if (!_writer && _created)
        ::unlink(_path.c_str());
}

Result<Done> RecordingSession::learnTechnology(std::string_view technology) {
    const std::string_view name = shortTechnologyName(technology);
    if (_writer && name != _technology)
        return Failure{"the telephony service now speaks " + std::string(name) + ", the recording is of " +
                       _technology};
    if (_writer)
        return Done{};
    if (_path != "-" && isRegularFile(_file.get()) && ::ftruncate(_file.get(), 0) != 0)
        return Failure{"cannot write " + _path + ": " + std::generic_category().message(errno)};
    // The writer closes what it is given, and so gets a descriptor of its own.
    const int copy = _path == "-" ? -1 : ::fcntl(_file.get(), F_DUPFD_CLOEXEC, 0);
    if (_path != "-" && copy < 0)
        return Failure{"cannot write " + _path + ": " + std::generic_category().message(errno)};
    Result<std::unique_ptr<RecordingWriter>> writer =
        _path == "-" ? RecordingWriter::create(_path, name) : RecordingWriter::adopt(copy, _path, name);
    _file.reset();
    if (!writer)
        return Failure{writer.reason()};
    _writer = *std::move(writer);
    _technology = name;
    return Done{};
}

Result<Done> RecordingSession::append(Time time, Bytes message) {
    Result<Done> appended = _writer->append(time, message);
    if (appended) {
        ++_messages;
        _bytes += message.size();
    }
    return appended;
}

Result<Done> RecordingSession::flush() {
    if (!_writer)
        return Done{};
    return _writer->flush();
}

Result<Done> RecordingSession::close() {
    if (!_writer)
        return Done{};
    return _writer->close();
}

bool RecordingSession::hasLostReader() const {
    pollfd watched{STDOUT_FILENO, 0, 0};
    return _path == "-" && ::poll(&watched, 1, 0) > 0 && (watched.revents & POLLERR) != 0;
}

} // namespace velmora

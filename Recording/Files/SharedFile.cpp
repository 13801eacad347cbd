// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Files/SharedFile.h"

#include <cerrno>
#include <cstdlib>
#include <system_error>
#include <utility>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace velmora {

namespace {

std::string errorText(int error) {
    return std::generic_category().message(error);
}

std::int64_t modificationTime(const struct stat& status) {
    constexpr std::int64_t second = 1'000'000'000;
    return status.st_mtim.tv_sec * second + status.st_mtim.tv_nsec;
}

class SharedFileSource final : public ByteSource {
public:
    SharedFileSource(std::shared_ptr<const SharedFile> file, std::uint64_t offset)
        : _file(std::move(file)), _offset(offset) {}

    Result<std::size_t> read(std::span<std::uint8_t> buffer) override {
        Result<std::size_t> count = _file->readAt(_offset, buffer);
        if (count)
            _offset += *count;
        return count;
    }

private:
    std::shared_ptr<const SharedFile> _file;
    std::uint64_t _offset;
};

} // namespace

SharedFile::SharedFile(int descriptor) : _descriptor(descriptor) {
    struct stat status = {};
    if (::fstat(descriptor, &status) == 0) {
        _size = static_cast<std::uint64_t>(status.st_size);
        _modified_ns = modificationTime(status);
    }
}

SharedFile::~SharedFile() {
    ::close(_descriptor);
}

Result<std::shared_ptr<SharedFile>> SharedFile::open(const std::string& path) {
    // Without waiting for the writer of a pipe, which is refused.
    const int descriptor = ::open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK);
    if (descriptor < 0)
        return Failure{"cannot open: " + errorText(errno)};
    std::shared_ptr<SharedFile> file(new SharedFile(descriptor));
    struct stat status = {};
    if (::fstat(descriptor, &status) != 0 || !S_ISREG(status.st_mode))
        return Failure{std::string("got ") + (S_ISDIR(status.st_mode) ? "a directory" : "a device or pipe") +
                       ", wanted a regular file"};
    return file;
}

Result<std::shared_ptr<SharedFile>> SharedFile::createNameless() {
    const char* const chosen = std::getenv("TMPDIR");
    const std::string folder = chosen && *chosen ? chosen : "/var/tmp";
    constexpr mode_t mode = 0600;
    int descriptor = ::open(folder.c_str(), O_RDWR | O_TMPFILE | O_CLOEXEC, mode);
    if (descriptor < 0) { // not every file system has nameless files
        std::string name = folder + "/velmora-XXXXXX";
        descriptor = ::mkostemp(name.data(), O_CLOEXEC);
        if (descriptor >= 0)
            ::unlink(name.c_str());
    }
    if (descriptor < 0)
        return Failure{"cannot create a temporary file in " + folder + ": " + errorText(errno)};
    return std::shared_ptr<SharedFile>(new SharedFile(descriptor));
}

std::string SharedFile::change() const {
    struct stat status = {};
    if (::fstat(_descriptor, &status) != 0)
        return "cannot be examined: " + errorText(errno);
    if (static_cast<std::uint64_t>(status.st_size) > _size)
        return "has grown";
    const bool isSame =
        static_cast<std::uint64_t>(status.st_size) == _size && modificationTime(status) == _modified_ns;
    return isSame ? "" : "has changed";
}

Result<std::size_t> SharedFile::readAt(std::uint64_t offset, std::span<std::uint8_t> buffer) const {
    for (;;) {
        const ssize_t count = ::pread(_descriptor, buffer.data(), buffer.size(), static_cast<off_t>(offset));
        if (count >= 0)
            return static_cast<std::size_t>(count);
        if (errno != EINTR)
            return Failure{"cannot read: " + errorText(errno)};
    }
}

Result<Done> SharedFile::writeAt(std::uint64_t offset, std::span<const std::uint8_t> bytes) const {
    while (!bytes.empty()) {
        const ssize_t count = ::pwrite(_descriptor, bytes.data(), bytes.size(), static_cast<off_t>(offset));
        if (count < 0 && errno == EINTR)
            continue;
        if (count < 0)
            return Failure{"cannot write a temporary file: " + errorText(errno)};
        offset += static_cast<std::uint64_t>(count);
        bytes = bytes.subspan(static_cast<std::size_t>(count));
    }
    return Done{};
}

std::unique_ptr<ByteSource> SharedFile::from(std::shared_ptr<const SharedFile> file, std::uint64_t offset) {
    return std::make_unique<SharedFileSource>(std::move(file), offset);
}

} // namespace velmora

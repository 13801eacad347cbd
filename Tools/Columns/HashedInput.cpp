// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Columns/HashedInput.h"

#include "Platform/Linux/Errno.h"
#include "Platform/Linux/Files/Files.h"
#include "Recording/Files/FileSource.h"
#include "Tools/Columns/ContentHash.h"

#include <cerrno>
#include <cstdlib>
#include <memory>
#include <vector>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace velmora {

namespace {

constexpr std::size_t bufferSize = std::size_t{256} << 10;

FileDescriptor temporaryFile() {
    const char* const directory = std::getenv("TMPDIR");
    return FileDescriptor(
        ::open(directory && *directory ? directory : "/tmp", O_TMPFILE | O_RDWR | O_CLOEXEC, 0600));
}

/// Notes when a read fails.
class NotingSource final : public ByteSource {
public:
    NotingSource(int descriptor, InputError& error) : _file(descriptor, true), _error(error) {}

    Result<std::size_t> read(std::span<std::uint8_t> buffer) override {
        Result<std::size_t> count = _file.read(buffer);
        if (!count)
            _error.reason = count.reason();
        return count;
    }

private:
    FileSource _file;
    InputError& _error;
};

} // namespace

Result<HashedInput> HashedInput::open(const std::string& path) {
    FileDescriptor file(path == "-" ? ::dup(STDIN_FILENO) : ::open(path.c_str(), O_RDONLY | O_CLOEXEC));
    if (!file)
        return Failure{"cannot open: " + errnoText(errno)};
    struct stat status = {};
    FileDescriptor copy;
    if (::fstat(file.get(), &status) != 0 || !S_ISREG(status.st_mode) ||
        ::lseek(file.get(), 0, SEEK_CUR) != 0) {
        copy = temporaryFile();
        if (!copy)
            return Failure{"cannot be kept for reading it twice: " + errnoText(errno)};
    }
    ContentHash hash;
    std::vector<std::uint8_t> buffer(bufferSize);
    std::uint64_t size = 0;
    FileSource source(file.get(), false);
    for (;;) {
        const Result<std::size_t> count = source.read(buffer);
        if (!count)
            return Failure{count.reason()};
        if (*count == 0)
            break;
        const Bytes part = Bytes(buffer).first(*count);
        hash.add(part);
        size += part.size();
        if (copy)
            if (const Result<Done> written = writeAll(copy.get(), part); !written)
                return Failure{"cannot be kept for reading it twice: " + written.reason()};
    }
    return HashedInput(copy ? std::move(copy) : std::move(file), hash.digits(), size);
}

Result<std::unique_ptr<ByteSource>> HashedInput::read(InputError& error) const {
    // A descriptor of its own position, not a copy that shares it.
    const std::string path = "/proc/self/fd/" + std::to_string(_file.get());
    const int descriptor = ::open(path.c_str(), O_RDONLY | O_CLOEXEC);
    if (descriptor < 0)
        return Failure{"cannot open: " + errnoText(errno)};
    return std::unique_ptr<ByteSource>(std::make_unique<NotingSource>(descriptor, error));
}

bool HashedInput::hasGrown() const {
    struct stat status = {};
    return ::fstat(_file.get(), &status) != 0 || static_cast<std::uint64_t>(status.st_size) != _size;
}

} // namespace velmora

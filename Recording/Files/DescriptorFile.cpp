// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Files/DescriptorFile.h"

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <system_error>
#include <utility>

#include <fcntl.h>
#include <poll.h>
#include <sys/stat.h>
#include <unistd.h>

namespace velmora {

namespace {

int syncDescriptor(int descriptor) {
    while (::fdatasync(descriptor) != 0)
        if (errno != EINTR)
            return errno;
    return 0;
}

} // namespace

OutputFile::Change changeOf(int descriptor, const std::string& path, std::uint64_t start,
                            std::uint64_t length) {
    using Kind = OutputFile::Change::Kind;
    struct stat file = {};
    struct stat named = {};
    if (::fstat(descriptor, &file) != 0)
        return {};
    const int error = ::stat(path.c_str(), &named) == 0 ? 0 : errno;
    const bool isNamed = error == 0 && named.st_dev == file.st_dev && named.st_ino == file.st_ino;
    // Any other error says nothing about the file: a directory above it may not be readable just now.
    if (error == 0 && !isNamed)
        return {Kind::Replaced, file.st_nlink == 0 ? 0 : length};
    if (file.st_nlink == 0)
        return {Kind::Removed, 0};
    if (error == ENOENT || error == ENOTDIR)
        return {Kind::Moved, length};
    const auto size = static_cast<std::uint64_t>(file.st_size);
    if (size < start + length)
        return {Kind::Truncated, size - std::min(size, start)};
    if (size > start + length)
        return {Kind::Altered, 0};
    return {};
}

DescriptorFile::DescriptorFile(int descriptor, bool owned) : _descriptor(descriptor), _owned(owned) {
    struct stat status = {};
    if (::fstat(_descriptor, &status) != 0 || !S_ISREG(status.st_mode))
        return;
    const bool appends = (::fcntl(_descriptor, F_GETFL) & O_APPEND) != 0;
    const off_t start = appends ? status.st_size : ::lseek(_descriptor, 0, SEEK_CUR);
    // In the middle of an existing file, truncating would remove what follows as well.
    _regular = start == status.st_size;
    _start = static_cast<std::uint64_t>(start);
}

void DescriptorFile::watchForChanges(std::string path) {
    if (!_regular)
        return;
    // At its own position a write to a file that has been truncated would leave a hole and hide the loss.
    ::fcntl(_descriptor, F_SETFL, ::fcntl(_descriptor, F_GETFL) | O_APPEND);
    _path = std::move(path);
}

DescriptorFile::~DescriptorFile() {
    close();
}

OutputFile::Written DescriptorFile::write(Bytes bytes) {
    for (;;) {
        const ssize_t count = ::write(_descriptor, bytes.data(), bytes.size());
        if (count >= 0) {
            noteWritten(static_cast<std::uint64_t>(count));
            return {static_cast<std::size_t>(count), 0};
        }
        if (errno == EAGAIN || errno == EWOULDBLOCK) {
            pollfd writable{_descriptor, POLLOUT, 0};
            ::poll(&writable, 1, -1);
        } else if (errno != EINTR) {
            return {0, errno};
        }
    }
}

/// An appending write leaves the position after what it wrote, wherever that was.
void DescriptorFile::noteWritten(std::uint64_t count) {
    if (!_path.empty() && !_misplaced) {
        const auto end = static_cast<std::uint64_t>(::lseek(_descriptor, 0, SEEK_CUR));
        if (end < _start + _length + count)
            _misplaced = end - count - std::min(end - count, _start);
    }
    _length += count;
}

OutputFile::Change DescriptorFile::change() const {
    if (_path.empty())
        return {};
    const Change change = changeOf(_descriptor, _path, _start, _length);
    using Kind = Change::Kind;
    const bool isNamed =
        change.kind == Kind::None || change.kind == Kind::Truncated || change.kind == Kind::Altered;
    return _misplaced && isNamed ? Change{Kind::Truncated, *_misplaced} : change;
}

int DescriptorFile::truncateTo(std::uint64_t size) {
    const auto end = static_cast<off_t>(_start + size);
    if (::ftruncate(_descriptor, end) != 0 || ::lseek(_descriptor, end, SEEK_SET) != end)
        return errno;
    _length = size;
    return 0;
}

void DescriptorFile::startSync() {
    if (_syncing.valid())
        return;
    try {
        _syncing = std::async(std::launch::async, syncDescriptor, _descriptor);
    } catch (const std::system_error&) { // no thread could be started
        _syncing = std::async(std::launch::deferred, syncDescriptor, _descriptor);
        _syncing.wait();
    }
}

std::optional<int> DescriptorFile::takeSyncResult() {
    if (!_syncing.valid() || _syncing.wait_for(std::chrono::seconds(0)) != std::future_status::ready)
        return std::nullopt;
    return _syncing.get();
}

int DescriptorFile::sync() {
    const int earlier = _syncing.valid() ? _syncing.get() : 0;
    const int now = syncDescriptor(_descriptor);
    // An error is returned once, to the first caller.
    return earlier != 0 ? earlier : now;
}

int DescriptorFile::close() {
    if (_syncing.valid())
        _syncing.wait();
    const int descriptor = std::exchange(_descriptor, -1);
    if (descriptor < 0 || !_owned)
        return 0;
    return ::close(descriptor) != 0 && errno != EINTR ? errno : 0;
}

} // namespace velmora

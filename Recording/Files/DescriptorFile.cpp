// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Files/DescriptorFile.h"

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

DescriptorFile::~DescriptorFile() {
    close();
}

OutputFile::Written DescriptorFile::write(Bytes bytes) {
    for (;;) {
        const ssize_t count = ::write(_descriptor, bytes.data(), bytes.size());
        if (count >= 0)
            return {static_cast<std::size_t>(count), 0};
        if (errno == EAGAIN || errno == EWOULDBLOCK) {
            pollfd writable{_descriptor, POLLOUT, 0};
            ::poll(&writable, 1, -1);
        } else if (errno != EINTR) {
            return {0, errno};
        }
    }
}

int DescriptorFile::truncateTo(std::uint64_t size) {
    const auto end = static_cast<off_t>(_start + size);
    return ::ftruncate(_descriptor, end) == 0 && ::lseek(_descriptor, end, SEEK_SET) == end ? 0 : errno;
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

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Files/FileSource.h"

#include <cerrno>
#include <system_error>
#include <utility>

#include <fcntl.h>
#include <poll.h>
#include <unistd.h>

namespace velmora {

Result<std::unique_ptr<ByteSource>> FileSource::open(const std::string& path, Hooks hooks) {
    if (path == "-")
        return std::unique_ptr<ByteSource>(
            std::make_unique<FileSource>(STDIN_FILENO, false, std::move(hooks)));
    const int descriptor = ::open(path.c_str(), O_RDONLY | O_CLOEXEC);
    if (descriptor < 0)
        return Failure{"cannot open: " + std::generic_category().message(errno)};
    return std::unique_ptr<ByteSource>(std::make_unique<FileSource>(descriptor, true, std::move(hooks)));
}

FileSource::FileSource(int descriptor, bool owned, Hooks hooks)
    : _descriptor(descriptor), _owned(owned), _hooks(std::move(hooks)) {}

FileSource::~FileSource() {
    if (_owned)
        ::close(_descriptor);
}

bool FileSource::wait() const {
    constexpr int interval_ms = 50;
    pollfd readable{_descriptor, POLLIN, 0};
    if (::poll(&readable, 1, 0) != 0)
        return true;
    if (_hooks.beforeWaiting)
        _hooks.beforeWaiting();
    if (!_hooks.whileWaiting)
        return true;
    int ready = 0;
    do {
        if (!_hooks.whileWaiting())
            return false;
        ready = ::poll(&readable, 1, interval_ms);
    } while (ready == 0 || (ready < 0 && errno == EINTR));
    return true;
}

Result<std::size_t> FileSource::read(std::span<std::uint8_t> buffer) {
    if (_hooks.mayRead && !_hooks.mayRead(_offset))
        return Failure{"interrupted"};
    if ((_hooks.beforeWaiting || _hooks.whileWaiting) && !wait())
        return Failure{"interrupted"};
    for (;;) {
        const ssize_t count = ::read(_descriptor, buffer.data(), buffer.size());
        if (count >= 0) {
            _offset += static_cast<std::uint64_t>(count);
            return static_cast<std::size_t>(count);
        }
        if (errno == EAGAIN || errno == EWOULDBLOCK) {
            // Standard input may have been made non-blocking by another process that shares it.
            pollfd readable{_descriptor, POLLIN, 0};
            ::poll(&readable, 1, -1);
        } else if (errno != EINTR) {
            return Failure{"cannot read: " + std::generic_category().message(errno)};
        }
    }
}

} // namespace velmora

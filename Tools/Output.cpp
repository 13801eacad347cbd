// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Output.h"

#include "Tools/Report.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <system_error>
#include <utility>

#include <poll.h>
#include <sys/sendfile.h>
#include <unistd.h>

namespace velmora {

namespace {

constexpr std::size_t flushThreshold = std::size_t{64} << 10;
/// What is kept in a file costs less in larger writes, for which the system has larger pages.
constexpr std::size_t detourThreshold = std::size_t{256} << 10;

} // namespace

Output::Output(int descriptor, std::string name) : _descriptor(descriptor), _name(std::move(name)) {}

Output::~Output() {
    flush();
}

void Output::put(std::string_view text) {
    if (_state != State::Open)
        return;
    const std::size_t threshold = _detour ? detourThreshold : flushThreshold;
    if (_buffer.size() + text.size() >= threshold) {
        flush();
        // What is large enough by itself goes without a copy.
        if (text.size() >= threshold) {
            write(text);
            return;
        }
    }
    _buffer += text;
}

void Output::flush() {
    write(_buffer);
    _buffer.clear();
}

void Output::write(std::string_view rest) {
    if (_detour && !rest.empty() && _state == State::Open)
        rest = _detour->take(rest);
    while (!rest.empty() && _state == State::Open) {
        const ssize_t count = ::write(_descriptor, rest.data(), rest.size());
        if (count >= 0)
            rest.remove_prefix(static_cast<std::size_t>(count));
        else
            handle(errno);
    }
}

void Output::handle(int error) {
    if (error == EAGAIN || error == EWOULDBLOCK) {
        pollfd writable{_descriptor, POLLOUT, 0};
        ::poll(&writable, 1, -1);
    } else if (error == EPIPE) {
        _state = State::Closed;
    } else if (error != EINTR) {
        _state = State::Failed;
        report("cannot write " + _name + ": " + std::generic_category().message(error));
    }
}

bool Output::putFile(int file, std::uint64_t offset, std::uint64_t size) {
    constexpr std::size_t largestCopy = std::size_t{1} << 30;
    flush();
    auto at = static_cast<off_t>(offset);
    const auto end = static_cast<off_t>(offset + size);
    while (at < end && _state == State::Open) {
        const std::size_t left = std::min(static_cast<std::size_t>(end - at), largestCopy);
        const ssize_t copied = ::sendfile(_descriptor, file, &at, left);
        if (copied > 0)
            continue;
        if (copied < 0 && (errno == EAGAIN || errno == EINTR || errno == EPIPE)) {
            handle(errno);
            continue;
        }
        // A file that is appended to, or a terminal, may not be a target; a read shows what else it is.
        std::array<char, flushThreshold> buffer;
        const ssize_t count = ::pread(file, buffer.data(), std::min(left, buffer.size()), at);
        if (count < 0 && errno == EINTR)
            continue;
        if (count <= 0)
            return false;
        write(std::string_view(buffer.data(), static_cast<std::size_t>(count)));
        at += count;
    }
    return true;
}

bool Output::hasClosedReader() const {
    pollfd watched{_descriptor, 0, 0};
    return ::poll(&watched, 1, 0) > 0 && (watched.revents & POLLERR) != 0;
}

} // namespace velmora

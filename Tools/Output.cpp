// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Output.h"

#include "Tools/Report.h"

#include <cerrno>
#include <system_error>
#include <utility>

#include <poll.h>
#include <unistd.h>

namespace velmora {

namespace {

constexpr std::size_t flushThreshold = std::size_t{64} << 10;

} // namespace

Output::Output(int descriptor, std::string name) : _descriptor(descriptor), _name(std::move(name)) {}

Output::~Output() {
    flush();
}

void Output::put(std::string_view text) {
    if (_state != State::Open)
        return;
    if (_buffer.size() + text.size() >= flushThreshold) {
        flush();
        // What is large enough by itself goes without a copy.
        if (text.size() >= flushThreshold) {
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
    while (!rest.empty() && _state == State::Open) {
        const ssize_t count = ::write(_descriptor, rest.data(), rest.size());
        if (count >= 0) {
            rest.remove_prefix(static_cast<std::size_t>(count));
        } else if (errno == EAGAIN || errno == EWOULDBLOCK) {
            pollfd writable{_descriptor, POLLOUT, 0};
            ::poll(&writable, 1, -1);
        } else if (errno == EPIPE) {
            _state = State::Closed;
        } else if (errno != EINTR) {
            const int error = errno;
            _state = State::Failed;
            report("cannot write " + _name + ": " + std::generic_category().message(error));
        }
    }
}

bool Output::hasClosedReader() const {
    pollfd watched{_descriptor, 0, 0};
    return ::poll(&watched, 1, 0) > 0 && (watched.revents & POLLERR) != 0;
}

} // namespace velmora

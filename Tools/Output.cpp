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
    _buffer += text;
    if (_buffer.size() >= flushThreshold)
        flush();
}

void Output::flush() {
    std::string_view rest = _buffer;
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
    _buffer.clear();
}

bool Output::hasLostReader() const {
    pollfd watched{_descriptor, 0, 0};
    return ::poll(&watched, 1, 0) > 0 && (watched.revents & POLLERR) != 0;
}

} // namespace velmora

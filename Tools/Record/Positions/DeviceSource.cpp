// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Errno.h"
#include "Platform/Linux/Files/FileDescriptor.h"
#include "Platform/Linux/Ports/SocketWatch.h"
#include "Recording/Positions/NMEASentence.h"
#include "Tools/Record/Positions/PositionSource.h"

#include <array>
#include <cerrno>
#include <utility>

#include <fcntl.h>
#include <unistd.h>

namespace velmora {

namespace {

class DeviceSource final : public PositionSource {
public:
    DeviceSource(const PositionChoice& choice, Events events)
        : _path(choice.path), _events(std::move(events)),
          _device(::open(_path.c_str(), O_RDONLY | O_NONBLOCK | O_NOCTTY | O_CLOEXEC)) {
        if (_device)
            _watch =
                std::make_unique<SocketWatch>(_device.get(), SocketWatch::For::Reading, [this] { read(); });
        else
            _events.news(_path + ": " + errnoText(errno) + "; recording goes on without positions");
    }

private:
    void read() {
        std::array<char, 4096> bytes{};
        const ::ssize_t count = ::read(_device.get(), bytes.data(), bytes.size());
        if (count < 0 && (errno == EAGAIN || errno == EINTR))
            return;
        if (count <= 0) {
            _watch.reset();
            _events.news(_path + (count < 0 ? ": " + errnoText(errno) : " has ended") +
                         "; recording goes on without positions");
            return;
        }
        _line.append(bytes.data(), static_cast<std::size_t>(count));
        for (std::size_t end = _line.find('\n'); end != std::string::npos; end = _line.find('\n')) {
            if (_line.starts_with('$'))
                _events.sentence(std::string_view(_line).substr(0, end + 1));
            _line.erase(0, end + 1);
        }
        if (_line.size() > NMEASentence::maximumLength)
            _line.clear();
    }

    std::string _path;
    Events _events;
    FileDescriptor _device;
    std::string _line;
    std::unique_ptr<SocketWatch> _watch;
};

} // namespace

std::unique_ptr<PositionSource> makeDeviceSource(const PositionChoice& choice,
                                                 PositionSource::Events events) {
    return std::make_unique<DeviceSource>(choice, std::move(events));
}

} // namespace velmora

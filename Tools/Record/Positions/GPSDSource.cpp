// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Ports/SocketWatch.h"
#include "Platform/MainQueue.h"
#include "Tools/Record/Positions/PositionSource.h"

#include <array>
#include <chrono>
#include <cstring>
#include <utility>

#include <gps.h>

namespace velmora {

namespace {

constexpr std::chrono::seconds retryInterval{2};

class GPSDSource final : public PositionSource {
public:
    GPSDSource(const PositionChoice& choice, MainQueue& queue, Events events)
        : _choice(choice), _events(std::move(events)), _timer(queue.repeating(retryInterval, [this] {
              if (!_watch)
                  connect();
          })) {
        connect();
    }
    ~GPSDSource() override { disconnect(); }

private:
    [[nodiscard]] std::string name() const { return "gpsd at " + _choice.host + ":" + _choice.port; }

    void connect() {
        _gps = {};
        if (::gps_open(_choice.host.c_str(), _choice.port.c_str(), &_gps) != 0) {
            if (!std::exchange(_isLost, true))
                _events.news(name() + " does not answer; recording goes on without positions, retrying");
            return;
        }
        // Its own sentences, which it makes for receivers of other protocols, too.
        if (::gps_stream(&_gps, WATCH_ENABLE | WATCH_NMEA, nullptr) != 0) {
            ::gps_close(&_gps);
            return;
        }
        if (std::exchange(_isLost, false))
            _events.news(name() + " is there");
        _watch = std::make_unique<SocketWatch>(static_cast<int>(_gps.gps_fd), SocketWatch::For::Reading,
                                               [this] { read(); });
    }

    void disconnect() {
        if (!_watch)
            return;
        _watch.reset();
        ::gps_close(&_gps);
    }

    void read() {
        std::array<char, 10'240> line{};
        // One wake-up takes a bounded number of sentences.
        for (int count = 0; count < 100 && ::gps_waiting(&_gps, 0); ++count) {
            line.front() = '\0';
            if (::gps_read(&_gps, line.data(), static_cast<int>(line.size())) < 0) {
                disconnect();
                _isLost = true;
                _events.news(name() + " is gone; recording goes on without positions, retrying");
                return;
            }
            const std::string_view text(line.data(), ::strnlen(line.data(), line.size()));
            if (text.starts_with('$'))
                _events.sentence(text);
        }
    }

    PositionChoice _choice;
    Events _events;
    ::gps_data_t _gps{};
    std::unique_ptr<SocketWatch> _watch; ///< null while there is no connection
    bool _isLost = false;                ///< which has been said
    std::unique_ptr<Timer> _timer;
};

} // namespace

std::unique_ptr<PositionSource> makeGPSDSource(const PositionChoice& choice, MainQueue& queue,
                                               PositionSource::Events events) {
    return std::make_unique<GPSDSource>(choice, queue, std::move(events));
}

} // namespace velmora

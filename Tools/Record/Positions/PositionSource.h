// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Platform/Fix.h"

#include <functional>
#include <memory>
#include <string>
#include <string_view>

namespace velmora {

class MainQueue;

/// Where a recorder gets the positions from.
struct PositionChoice {
    enum class Kind {
        None,
        GPSD,  ///< a gpsd at `host` and `port`
        Modem, ///< the position messages of the technology Modem
        File,  ///< `path`: GPX or NMEA by time, or a device or pipe that NMEA sentences come from
    };

    Kind kind = Kind::None;
    std::string host = {};
    std::string port = {};
    std::string path = {};
};

/// What `--gps` takes: "gpsd", "gpsd:HOST", "gpsd:HOST:PORT" (an IPv6 address in brackets), "modem", or a
/// file's name.
[[nodiscard]] PositionChoice positionChoice(const std::string& text);

/// A receiver whose sentences come by themselves. Its functions are called on the event loop. Main thread
/// only.
class PositionSource {
public:
    struct Events {
        std::function<void(std::string_view sentence)> sentence;
        /// For the user: the receiver was lost, is back.
        std::function<void(const std::string& text)> news;
    };

    virtual ~PositionSource() = default;
};

/// A gpsd, to which it connects again when the connection is lost.
[[nodiscard]] std::unique_ptr<PositionSource> makeGPSDSource(const PositionChoice& choice, MainQueue& queue,
                                                             PositionSource::Events events);
/// A device or pipe: what is written to it line by line.
[[nodiscard]] std::unique_ptr<PositionSource> makeDeviceSource(const PositionChoice& choice,
                                                               PositionSource::Events events);

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Clock.h"
#include "Platform/Fix.h"
#include "Platform/Result.h"
#include "Tools/Record/Positions/PositionSource.h"

#include <cstddef>
#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace velmora {

class ServiceClient;

/// The positions that a recorder writes beside the messages, wherever they come from. Main thread only.
class RecordedPositions {
public:
    struct Events {
        /// A sentence has come, or is due.
        std::function<void(Time time, std::string_view sentence)> sentence;
        std::function<void(const std::string& text)> news;
    };

    explicit RecordedPositions(PositionChoice choice) : _choice(std::move(choice)) {}

    /// Reads a track file; call it before the recording is opened. Fails where there are no fixes.
    [[nodiscard]] Result<Done> load();
    [[nodiscard]] bool areWanted() const { return _choice.kind != PositionChoice::Kind::None; }
    /// Starts a receiver.
    void start(ServiceClient& client, Events events);
    /// Ends it.
    void stop() { _source.reset(); }
    /// A message has arrived and is about to be recorded: passes on the positions that come before it.
    void willRecord(Time time, Bytes message);

private:
    void pass(const Fix& fix);

    PositionChoice _choice;
    Events _events;
    std::vector<Fix> _fixes; ///< of a track file
    std::size_t _next = 0;
    bool _isDevice = false;
    std::unique_ptr<PositionSource> _source;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Ports/FrameMemory.h"
#include "Platform/Linux/QtMainQueue.h"
#include "Platform/PeerLog.h"

#include <cstddef>
#include <memory>

namespace velmora {

/// What the peers of several ports share, so that more ports or connections do not raise the limits. Held by
/// every port. Main thread only.
class PortPeers {
public:
    explicit PortPeers(std::size_t frameMemory = FrameMemory::defaultLimit)
        : _memory(std::make_shared<FrameMemory>(frameMemory)) {}

    [[nodiscard]] PeerLog& log() { return _log; }
    [[nodiscard]] const std::shared_ptr<FrameMemory>& memory() const { return _memory; }

private:
    QtMainQueue _queue;
    PeerLog _log{_queue};
    std::shared_ptr<FrameMemory> _memory;
};

} // namespace velmora

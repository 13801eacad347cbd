// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Engine/EventEngine.h"
#include "Analysis/Events/EventSink.h"
#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/Observations/Observation.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace velmora {

/// What happened in a recording, found while its index is made: what the built-in detectors find. Main thread
/// only.
class PlaybackEvents final : private ObservationSink, private EventSink {
public:
    /// Later ones are left out.
    static constexpr std::size_t most = 100'000;

    struct Found {
        Time time;
        std::string text;
    };

    /// Of the messages that the decoder decodes from now on, which must outlive this.
    explicit PlaybackEvents(LogGenerator& decoder);
    ~PlaybackEvents() override;

    /// There are no more messages.
    void finish() { _engine.finish(); }

    /// The first event after that time, and the last one before it; null where there is none.
    [[nodiscard]] const Found* after(Time time) const;
    [[nodiscard]] const Found* before(Time time) const;
    [[nodiscard]] const std::vector<Found>& all() const { return _all; }

private:
    void observed(const ObservedMessage& message) override;
    void happened(const Event& event) override;

    LogGenerator& _decoder;
    EventEngine _engine;
    std::vector<Found> _all; ///< in the order of their times
};

} // namespace velmora

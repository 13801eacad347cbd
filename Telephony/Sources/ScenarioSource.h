// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/Scenario.h"
#include "Telephony/Sources/LogSource.h"
#include "Telephony/Sources/MessagePlayer.h"

#include <functional>
#include <memory>
#include <string>

namespace velmora {

/// Plays a scenario; each start creates it again and so plays the same messages. Main thread only.
class ScenarioSource final : public LogSource {
public:
    using Make = std::function<std::unique_ptr<Scenario>()>;

    /// Queue and clock must outlive the source. Precondition: speed > 0.
    ScenarioSource(MainQueue& queue, const Clock& clock, Make make, double speed);

    [[nodiscard]] std::string_view technology() const override { return _technology; }
    void start(LogSink& sink) override;
    void stop() override { _player.stop(); }

private:
    Make _make;
    std::string _technology;
    MessagePlayer _player;
};

} // namespace velmora

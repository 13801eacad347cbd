// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Platform/MainQueue.h"
#include "Platform/TelephonyService.h"
#include "Telephony/ModemManager/ModemFollower.h"
#include "Telephony/ModemManager/ModemSession.h"
#include "Telephony/ModemManager/RateMemory.h"
#include "Telephony/Sources/LogSource.h"

#include <chrono>
#include <filesystem>
#include <memory>
#include <string_view>

namespace velmora {

/// The modem that ModemManager manages, live, as messages of the technology Modem, whatever its radio
/// technology and whether there is one or not. It is queried only between `start` and `stop`. Main thread
/// only.
class ModemManagerSource final : public LogSource, private ModemFollower::Observer {
public:
    struct Options {
        ModemFollower::Options follower;
        std::filesystem::path directory; ///< for what has to survive a crash; empty for nothing
    };

    /// How long a client waits to hear that ModemManager does not answer.
    static constexpr std::chrono::seconds patience{2};

    /// Looks for modems from now on. Queue and clock must outlive the source.
    ModemManagerSource(MainQueue& queue, const Clock& clock, const Options& options);

    [[nodiscard]] std::string_view technology() const override { return kVoxLogChannelTechnology_Modem; }
    void start(LogSink& sink) override;
    void stop() override;

private:
    void modemChosen() override;
    void modemChanged() override;
    void objectChanged(const std::string& path, const Array& arguments) override;

    void begin();
    void reportAbsence(const Presence& presence);
    void reportObstacle();
    void send(std::uint32_t code, const Dictionary& root);

    MainQueue& _queue;
    const Clock& _clock;
    RateMemory _memory;
    LogSink* _sink = nullptr;       ///< null while stopped
    std::shared_ptr<bool> _started; ///< queued tasks hold it weakly: they do nothing after `stop`
    bool _hasRestored = false;      ///< what a crash left changed is put back
    std::shared_ptr<bool> _alive = std::make_shared<bool>(true);
    ModemFollower _follower;
    std::unique_ptr<ModemSession> _session; ///< while started and while there is a modem
};

} // namespace velmora

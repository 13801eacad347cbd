// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Platform/MainQueue.h"
#include "Telephony/Drives/RecordBuilder.h"
#include "Telephony/ModemManager/ModemFollower.h"
#include "Telephony/ModemManager/ModemSession.h"
#include "Telephony/Sources/LogSource.h"

#include <functional>
#include <memory>
#include <string_view>

namespace velmora {

/// The modem that ModemManager manages, live: the service's extra stream with its cells, its SIM and its
/// bearers. Its technology follows the access technology of the modem; it is empty until a modem is known,
/// and stays what it was while the modem is on no network or has been removed. The modem is queried only
/// between `start` and `stop`. Main thread only.
class ModemManagerSource final : public LogSource, private ModemFollower::Observer {
public:
    /// Looks for modems from now on. Queue and clock must outlive the source.
    ModemManagerSource(MainQueue& queue, const Clock& clock, ModemFollower::Options options);

    [[nodiscard]] std::string_view technology() const override { return _technology; }
    void setTechnologyCallback(std::function<void()> changed) override { _changed = std::move(changed); }
    void start(LogSink& sink) override;
    void stop() override;

private:
    void modemChosen() override;
    void modemChanged() override;
    void objectChanged(const std::string& path, const Array& arguments) override;

    void updateTechnology(bool newModem);
    void beginSession();
    void send(const RecordBuilder& record);

    MainQueue& _queue;
    const Clock& _clock;
    std::string_view _technology;
    std::function<void()> _changed;
    LogSink* _sink = nullptr; ///< null while stopped
    ModemFollower _follower;
    std::unique_ptr<ModemSession> _session; ///< while started and while there is a modem
};

} // namespace velmora

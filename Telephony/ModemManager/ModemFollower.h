// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/MainQueue.h"
#include "Telephony/ModemManager/Bus/ModemManagerBus.h"
#include "Telephony/ModemManager/FaultLog.h"
#include "Telephony/ModemManager/ModemChoice.h"
#include "Telephony/ModemManager/ModemObjects.h"
#include "Telephony/ModemManager/Reports/ModemState.h"

#include <map>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// Tracks the modem and its properties as ModemManager publishes them, without querying the modem itself. A
/// missing bus, ModemManager or modem is logged once and retried. Main thread only.
class ModemFollower final : private ModemManagerBus::Observer {
public:
    class Observer {
    public:
        virtual ~Observer() = default;
        /// The followed modem has changed, or there is none any more, or the reason for that has changed.
        virtual void modemChosen() = 0;
        /// Something of the followed modem has changed, its interfaces included.
        virtual void modemChanged() = 0;
        /// Properties of another object have changed; the arguments are those of the signal.
        virtual void objectChanged(const std::string& path, const Array& arguments) = 0;
    };

    struct Options {
        ModemChoice choice;
        std::string busAddress; ///< the system bus where it is empty
    };

    /// The delay before the bus and ModemManager are retried after a failure.
    static constexpr std::chrono::seconds retryInterval{10};

    /// Begins at once, without a call of the observer yet. Queue and observer must outlive it.
    ModemFollower(MainQueue& queue, Options options, Observer& observer);
    ModemFollower(const ModemFollower&) = delete;
    ModemFollower& operator=(const ModemFollower&) = delete;

    /// The followed modem; null while there is none. Valid until the next call of the observer.
    [[nodiscard]] const Modem* modem() const { return _objects.find(_chosen); }
    /// The modem of that path, followed or not; null where there is none.
    [[nodiscard]] const Modem* modemAt(std::string_view path) const { return _objects.find(path); }
    /// Why there is none; absent until it is known.
    [[nodiscard]] const std::optional<Presence>& presence() const { return _presence; }
    [[nodiscard]] ModemManagerBus& bus() { return _bus; }
    [[nodiscard]] FaultLog& faults() { return _faults; }
    /// ModemManager's own address on the bus, another one each time that it starts; empty while it is
    /// unknown.
    [[nodiscard]] const std::string& owner() const { return _owner; }

private:
    void serviceAppeared() override;
    void serviceVanished() override;
    void busLost() override;
    void signalArrived(const std::string& path, std::string_view member, const Array& arguments) override;

    void open(bool startsService);
    void list(bool startsService);
    void listed(const BusReply& reply);
    void retryLater();
    void forgetModems(const Presence& why);
    void choose();
    void setPresence(const Presence& presence);
    [[nodiscard]] const Modem* chosenOne() const;
    [[nodiscard]] std::string iccidOf(const Modem& modem) const;
    void askForICCIDs();

    MainQueue& _queue;
    Options _options;
    Observer& _observer;
    FaultLog _faults;
    ModemManagerBus _bus;
    ModemObjects _objects;
    std::string _owner;
    std::string _chosen;   ///< the path of the followed modem; empty while there is none
    std::string _identity; ///< of the modem that had the chosen index
    std::optional<Presence> _presence;
    std::map<std::string, std::string, std::less<>> _iccids; ///< by the SIM's path; empty until answered
    bool _listed = false;                                    ///< the existing modems have been listed
    bool _retrying = false;
    bool _isMade = false; ///< the constructor has ended: the observer may be called
    /// Queued tasks hold it weakly: they do nothing after the object's destruction.
    std::shared_ptr<bool> _alive = std::make_shared<bool>(true);
};

} // namespace velmora

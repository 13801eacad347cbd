// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/MainQueue.h"
#include "Telephony/ModemManager/ModemFollower.h"

#include <chrono>
#include <functional>
#include <map>
#include <memory>
#include <string>
#include <string_view>

namespace velmora {

/// The objects that belong to a modem: its SIMs, its bearers, and ModemManager itself. The properties of each
/// are read once and then kept up to date by signals; one that does not answer delays no other, and is read
/// again after a minute. Main thread only.
class ModemParts {
public:
    /// The time-out of each.
    static constexpr std::chrono::seconds timeout{10};
    static constexpr std::chrono::minutes retryInterval{1};

    struct Part {
        std::string_view interface;
        DictionaryRef properties; ///< null until they are known
        std::string reason;       ///< why they are not, as the bus names it
    };

    /// The part's properties are known, with those that have changed, or with null where all were read; or
    /// they could not be read.
    using Changed = std::function<void(const std::string& path, const Part& part, const Dictionary* changed)>;
    using Refused = std::function<void(const Part& part, const BusReply& reply)>;

    /// All must outlive it.
    ModemParts(MainQueue& queue, ModemFollower& follower, Changed changed, Refused refused);
    ModemParts(const ModemParts&) = delete;
    ModemParts& operator=(const ModemParts&) = delete;

    /// Follows these paths, of these interfaces, and no others.
    void follow(const std::map<std::string, std::string_view>& wanted);
    /// The arguments of PropertiesChanged of an object.
    void objectChanged(const std::string& path, const Array& arguments);
    /// Null where that path is not followed.
    [[nodiscard]] const Part* find(const std::string& path) const;

private:
    void read(const std::string& path);
    void readAgainLater();

    MainQueue& _queue;
    ModemFollower& _follower;
    Changed _changed;
    Refused _refused;
    std::map<std::string, Part> _parts; ///< by path
    bool _retrying = false;
    std::shared_ptr<bool> _alive = std::make_shared<bool>(true);
};

} // namespace velmora

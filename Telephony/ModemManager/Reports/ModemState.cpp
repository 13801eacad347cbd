// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/Reports/ModemState.h"

#include "Telephony/ModemManager/Bus/ModemManagerNames.h"
#include "Telephony/ModemManager/Members/MemberTable.h"

#include <algorithm>

namespace velmora {
namespace {

constexpr std::int64_t failedState = -1;

/// MMModemLock: 1 is none, and the modem works without the second codes (3 and 5), which protect features of
/// the SIM.
constexpr std::string_view locks[] = {
    "",
    "",
    "SIM PIN",
    "",
    "SIM PUK",
    "",
    "service provider's code",
    "service provider's unblocking code",
    "network's code",
    "network's unblocking code",
    "SIM's device code",
    "corporate code",
    "corporate unblocking code",
    "first SIM's code",
    "first SIM's unblocking code",
    "network subset's code",
    "network subset's unblocking code",
};
constexpr std::int64_t lockedByOther = std::size(locks);

/// MMModemStateFailedReason.
constexpr std::string_view failures[] = {
    "no reason",
    "unknown reason",
    "the SIM is missing",
    "the SIM does not answer or is broken",
    "its capabilities are unknown",
    "the embedded SIM has no profile",
};

bool mustBeOpened(std::int64_t lock) {
    return lock >= lockedByOther || (lock > 0 && !locks[lock].empty());
}

void remove(Dictionary& root, std::string_view key, bool unwanted) {
    if (unwanted)
        root.remove(key);
}

} // namespace

DictionaryRef rootWithoutModem(const Presence& presence) {
    DictionaryRef root = makeDictionary();
    root->set(kVoxModemPresence, static_cast<std::int64_t>(presence.state));
    if (!presence.reason.empty())
        root->set(kVoxModemReason, presence.reason);
    return root;
}

DictionaryRef rootOf(const Modem& modem, std::string_view reason) {
    DictionaryRef root = rootWithoutModem({ModemPresence::Present, std::string(reason)});
    setKeys(*root, MemberUse::State, MemberOf::Modem, modem[mm::modem]);
    remove(*root, kVoxModemFailedReason, !((*root)[kVoxModemState] == Value(failedState)));
    const std::int64_t* lock = (*root)[kVoxModemLock].asInteger();
    remove(*root, kVoxModemLock, lock && !mustBeOpened(*lock));
    return root;
}

std::string obstacleOf(const Modem& modem) {
    const DictionaryRef root = rootOf(modem);
    if (const std::int64_t* lock = (*root)[kVoxModemLock].asInteger())
        return "is locked (" +
               (*lock < lockedByOther ? std::string(locks[*lock]) : "lock " + std::to_string(*lock)) + ')';
    if (!((*root)[kVoxModemState] == Value(failedState)))
        return {};
    const std::int64_t* reason = (*root)[kVoxModemFailedReason].asInteger();
    if (!reason)
        return "has failed";
    return "has failed (" +
           (*reason < std::ssize(failures) ? std::string(failures[*reason])
                                           : "reason " + std::to_string(*reason)) +
           ')';
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Modem/ModemMessage.h"

#include "PropertyLists/PropertyList.h"

#include <memory>
#include <stdexcept>

namespace velmora::records {
namespace {

constexpr int pinLock = 2;           ///< MM_MODEM_LOCK_SIM_PIN
constexpr int simMissingFailure = 2; ///< MM_MODEM_STATE_FAILED_REASON_SIM_MISSING

} // namespace

DictionaryRef modemAccount(const ModemPhone& phone) {
    const auto account = std::make_shared<Dictionary>();
    account->set(kVoxModemPresence, static_cast<std::int64_t>(phone.presence));
    if (!phone.reason.empty())
        account->set(kVoxModemReason, phone.reason);
    if (!phone.isPresent())
        return account;
    account->set(kVoxModemState, static_cast<std::int64_t>(phone.state));
    if (phone.isSIMMissing)
        account->set(kVoxModemFailedReason, simMissingFailure);
    if (phone.isLocked)
        account->set(kVoxModemLock, pinLock);
    return account;
}

RecordBuilder modemMessage(std::uint32_t code, const DictionaryRef& account) {
    const auto payload = writeBinaryPropertyList(Value(account));
    if (!payload)
        throw std::logic_error("payload cannot be written: " + payload.reason());
    return RecordBuilder(code, Bytes(*payload));
}

} // namespace velmora::records

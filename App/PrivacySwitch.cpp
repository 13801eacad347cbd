// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/PrivacySwitch.h"

#include "Export/Masking/MessageMask.h"
#include "Platform/SystemLog.h"
#include "Platform/TelephonyService.h"

#include <utility>

namespace velmora {

namespace {

constexpr const char* domain = "com.velmora.velmora";
constexpr const char* key = "MaskIdentities";

} // namespace

PrivacySwitch::PrivacySwitch(Preferences& preferences, std::optional<MaskKey> maskKey)
    : _preferences(preferences), _key(std::move(maskKey)), _isOn(preferences.boolean(domain, key)) {}

PrivacySwitch::~PrivacySwitch() = default;

void PrivacySwitch::setOn(bool isOn) {
    _isOn = isOn;
    _preferences.setBoolean(domain, key, isOn);
    _preferences.synchronize(domain);
}

MessageMask* PrivacySwitch::mask() {
    if (!_key) {
        const Result<MaskKey> random = MaskKey::random();
        if (!random) {
            logLine(LogPriority::Error, random.reason());
            return nullptr;
        }
        _key = *random;
    }
    if (!_mask)
        _mask = std::make_unique<MessageMask>(MaskOptions{*_key});
    return _mask.get();
}

std::optional<MaskSeal> PrivacySwitch::seal() const {
    if (!_isOn || !_mask)
        return std::nullopt;
    const MaskOptions& options = _mask->options();
    return MaskSeal{options.level, options.key.fingerprint(), {}};
}

std::optional<Data> PrivacySwitch::shown(const Data& message, std::string_view technology, Time now) {
    if (!_isOn)
        return message;
    MessageMask* const masking = mask();
    if (!masking)
        return std::nullopt;
    LoggedMessage logged;
    logged.time = now;
    logged.message = message;
    std::optional<LoggedMessage> masked = masking->mask(std::move(logged), shortTechnologyName(technology));
    return masked ? std::optional(std::move(masked->message)) : std::nullopt;
}

} // namespace velmora

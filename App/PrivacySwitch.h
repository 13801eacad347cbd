// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/MaskKey.h"
#include "Export/Masking/Sealing/MaskSeal.h"
#include "Platform/Bytes.h"
#include "Platform/Clock.h"
#include "Platform/Preferences.h"

#include <memory>
#include <optional>
#include <string_view>

namespace velmora {

class MessageMask;

/// Whether messages are masked before they are decoded, so that whatever is shown and saved is masked too.
/// Main thread only.
class PrivacySwitch {
public:
    /// As the preferences remember it. Without a key there is a random one, the same until this ends.
    /// `preferences` must outlive it.
    PrivacySwitch(Preferences& preferences, std::optional<MaskKey> key);
    ~PrivacySwitch();
    PrivacySwitch(const PrivacySwitch&) = delete;
    PrivacySwitch& operator=(const PrivacySwitch&) = delete;

    [[nodiscard]] bool isOn() const { return _isOn; }
    /// The preferences remember it.
    void setOn(bool isOn);

    /// What a file of masked messages says of itself. Absent where they are not masked, or nothing has been.
    [[nodiscard]] std::optional<MaskSeal> seal() const;

    /// The message as it may be shown, of that technology, which arrives now. Absent where nothing of it may
    /// be shown.
    [[nodiscard]] std::optional<Data> shown(const Data& message, std::string_view technology, Time now);

private:
    [[nodiscard]] MessageMask* mask();

    Preferences& _preferences;
    std::optional<MaskKey> _key;
    std::unique_ptr<MessageMask> _mask; ///< made when it is first needed
    bool _isOn;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/MaskKey.h"
#include "Export/Masking/MaskLevel.h"
#include "Export/Masking/Pseudonyms/AddressPseudonyms.h"
#include "Export/Masking/Pseudonyms/DigitPseudonyms.h"
#include "Export/Masking/Pseudonyms/NumberPseudonyms.h"
#include "Export/Masking/Pseudonyms/TextPseudonyms.h"

#include <chrono>
#include <optional>

namespace velmora {

/// What is masked, and how.
struct MaskOptions {
    MaskKey key;
    MaskLevel level = MaskLevel::Identity;
    bool keepsUnknown = false; ///< what is not known to be harmless stays too
    /// The level at which the messages have been masked with the same key already: that is not done again.
    std::optional<MaskLevel> done = std::nullopt;
    /// What is subtracted from times where they are masked; absent for what the first message decides.
    std::optional<std::chrono::nanoseconds> shift = std::nullopt;

    [[nodiscard]] bool masksIdentities() const { return !done; }
    [[nodiscard]] bool masksAreas() const {
        return level >= MaskLevel::Location && (!done || *done < MaskLevel::Location);
    }
    [[nodiscard]] bool masksTimes() const {
        return level >= MaskLevel::All && (!done || *done < MaskLevel::All);
    }
};

/// The pseudonyms of one key.
struct Pseudonyms {
    explicit Pseudonyms(const MaskOptions& options)
        : hash(options.key.bytes), numbers(hash), digits(hash, options.masksAreas() ? &numbers : nullptr),
          addresses(hash), texts(hash, numbers, digits, addresses, options.masksAreas()) {}
    Pseudonyms(const Pseudonyms&) = delete;
    Pseudonyms& operator=(const Pseudonyms&) = delete;

    KeyedHash hash;
    NumberPseudonyms numbers;
    DigitPseudonyms digits;
    AddressPseudonyms addresses;
    TextPseudonyms texts;
};

} // namespace velmora

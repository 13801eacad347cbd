// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/MaskReport.h"
#include "Export/Masking/PropertyLists/PropertyKeys.h"
#include "Export/Masking/Pseudonyms/Pseudonyms.h"
#include "PropertyLists/Value.h"

#include <chrono>
#include <optional>

namespace velmora {

/// Masks the values of property lists, in place.
class PropertyListMask {
public:
    /// What it refers to must outlive it.
    PropertyListMask(const MaskOptions& options, Pseudonyms& pseudonyms, MaskReport& report)
        : _options(options), _pseudonyms(pseudonyms), _report(report) {}

    /// Whether anything has changed. A root that is none is set where nothing of the list may stay.
    /// `shift` is subtracted from dates. Precondition: nothing else refers to the list's nodes.
    bool mask(Value& root, PropertyListKind kind, std::chrono::nanoseconds shift);

private:
    struct Context {
        PropertyForm form = PropertyForm::Text; ///< of the nearest key around
        CellIdentityForm cell = CellIdentityForm::GSM;
    };

    bool maskValue(Value& value, const Context& context);
    bool maskDictionary(Dictionary& dictionary, const Context& context);
    bool maskDisplay(Dictionary& dictionary, const Context& context);
    bool maskText(Value& value, const Context& context);
    bool maskInteger(Value& value, const Context& context);
    bool maskData(Value& value, const Context& context);
    /// Puts the value there unless it is the same.
    bool replace(Value& value, Value masked, Masked what);
    bool remove(Value& value, Masked what);
    [[nodiscard]] std::optional<std::uint64_t> maskedNumber(const Context& context, std::uint64_t number);

    const MaskOptions& _options;
    Pseudonyms& _pseudonyms;
    MaskReport& _report;
    PropertyListKind _kind = PropertyListKind::Modem;
    std::chrono::nanoseconds _shift{};
};

} // namespace velmora

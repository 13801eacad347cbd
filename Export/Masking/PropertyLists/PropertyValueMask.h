// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/MaskReport.h"
#include "Export/Masking/PropertyLists/PropertyKeys.h"
#include "Export/Masking/Pseudonyms/Pseudonyms.h"
#include "PropertyLists/Value.h"

#include <chrono>
#include <cstdint>
#include <optional>

namespace velmora {

/// What is known of a value by where it stands in a property list.
struct PropertyContext {
    PropertyForm form = PropertyForm::Text; ///< of the nearest key around
    CellIdentityForm cell = CellIdentityForm::GSM;
};

/// Masks single values of property lists, in place: texts, numbers, data and dates. One that cannot be masked
/// and must not stay becomes none.
class PropertyValueMask {
public:
    /// What it refers to must outlive it.
    PropertyValueMask(const MaskOptions& options, Pseudonyms& pseudonyms, MaskReport& report)
        : _options(options), _pseudonyms(pseudonyms), _report(report) {}

    /// Whether the value has changed. `shift` is subtracted from dates. Precondition: it is neither an array
    /// nor a dictionary.
    bool mask(Value& value, const PropertyContext& context, std::chrono::nanoseconds shift);

private:
    bool maskText(Value& value, const PropertyContext& context);
    bool maskInteger(Value& value, const PropertyContext& context);
    bool maskReal(Value& value, const PropertyContext& context);
    bool maskData(Value& value, const PropertyContext& context);
    bool maskDate(Value& value, std::chrono::nanoseconds shift);
    /// Removes what stands where an identity should be and is none, such as a date.
    bool maskUnexpected(Value& value, const PropertyContext& context);
    /// Puts the value there unless it is the same.
    bool replace(Value& value, Value masked, Masked what);
    bool remove(Value& value, Masked what);
    [[nodiscard]] std::optional<std::uint64_t> maskedNumber(const PropertyContext& context,
                                                            std::uint64_t number);

    const MaskOptions& _options;
    Pseudonyms& _pseudonyms;
    MaskReport& _report;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/MaskReport.h"
#include "Export/Masking/PropertyLists/PropertyKeys.h"
#include "Export/Masking/PropertyLists/PropertyValueMask.h"
#include "Export/Masking/Pseudonyms/Pseudonyms.h"
#include "PropertyLists/Value.h"

#include <chrono>

namespace velmora {

/// Masks the values of property lists, in place.
class PropertyListMask {
public:
    /// What it refers to must outlive it.
    PropertyListMask(const MaskOptions& options, Pseudonyms& pseudonyms, MaskReport& report)
        : _options(options), _report(report), _values(options, pseudonyms, report) {}

    /// Whether anything has changed. A root that is none is set where nothing of the list may stay.
    /// `shift` is subtracted from dates. Precondition: nothing else refers to the list's nodes.
    bool mask(Value& root, PropertyListKind kind, std::chrono::nanoseconds shift);

private:
    bool maskValue(Value& value, const PropertyContext& context);
    bool maskDictionary(Dictionary& dictionary, const PropertyContext& context);
    bool maskDisplay(Dictionary& dictionary, const PropertyContext& context);

    const MaskOptions& _options;
    MaskReport& _report;
    PropertyValueMask _values;
    PropertyListKind _kind = PropertyListKind::Modem;
    std::chrono::nanoseconds _shift{};
};

} // namespace velmora

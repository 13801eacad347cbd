// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/PropertyLists/PropertyListMask.h"

#include "Export/Masking/PropertyLists/PropertyClass.h"
#include "Platform/TelephonyService.h"

#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace velmora {

namespace {

using enum PropertyForm;

/// What stands in a display for an entry that is not known. Without it a dictionary of two entries would
/// become one of a single entry, which is shown otherwise.
constexpr std::string_view removedText = "(removed)";

CellIdentityForm cellFormOf(const Dictionary& cell, CellIdentityForm otherwise) {
    const std::string* const technology = cell[kVoxCellMonitorCellRadioAccessTechnology].asString();
    if (!technology)
        return otherwise;
    if (technology->ends_with("LTE"))
        return CellIdentityForm::LTE;
    if (technology->ends_with("NR"))
        return CellIdentityForm::NR;
    if (technology->ends_with("UMTS") || technology->ends_with("UTRAN"))
        return CellIdentityForm::UMTS;
    return CellIdentityForm::GSM;
}

} // namespace

bool PropertyListMask::mask(Value& root, PropertyListKind kind, std::chrono::nanoseconds shift) {
    _kind = kind;
    _shift = shift;
    const bool isExpected = kind == PropertyListKind::Cells || kind == PropertyListKind::Contexts
                                ? root.asArray() != nullptr
                                : root.asDictionary() != nullptr;
    if (!isExpected && !_options.keepsUnknown) {
        _report.add(Masked::UnknownKey);
        root = Value();
        return true;
    }
    return maskValue(root, {});
}

bool PropertyListMask::maskValue(Value& value, const PropertyContext& context) {
    if (Dictionary* const dictionary = value.asDictionary())
        return _kind == PropertyListKind::Display ? maskDisplay(*dictionary, context)
                                                  : maskDictionary(*dictionary, context);
    if (Array* const array = value.asArray()) {
        bool changed = false;
        std::vector<Value> kept;
        for (std::size_t i = 0; i < array->size(); ++i) {
            Value& element = array->slot(i);
            changed = maskValue(element, context) || changed;
            if (!element.isNone())
                kept.push_back(element);
        }
        if (kept.size() != array->size()) {
            array->clear();
            for (Value& each : kept)
                array->append(std::move(each));
        }
        return changed;
    }
    return _values.mask(value, context, _shift);
}

bool PropertyListMask::maskDictionary(Dictionary& dictionary, const PropertyContext& context) {
    bool changed = false;
    std::vector<std::string> removed;
    const CellIdentityForm cell = cellFormOf(dictionary, context.cell);
    for (std::size_t i = 0; i < dictionary.size(); ++i) {
        const std::string& key = (dictionary.begin() + static_cast<std::ptrdiff_t>(i))->key;
        const std::optional<PropertyForm> own = formOf(_kind, key);
        if (!own) {
            if (!_options.keepsUnknown) {
                _report.add(Masked::UnknownKey);
                removed.push_back(key);
            }
            continue;
        }
        // What stands inside an identity is part of it, unless it is one by itself.
        const bool isInherited = *own == Inner || (classOf(context.form) && !classOf(*own));
        Value& value = dictionary.slot(key);
        changed = maskValue(value, {isInherited ? context.form : *own, cell}) || changed;
        if (value.isNone())
            removed.push_back(key);
    }
    for (const std::string& key : removed)
        dictionary.remove(key);
    return changed || !removed.empty();
}

bool PropertyListMask::maskDisplay(Dictionary& dictionary, const PropertyContext& context) {
    bool changed = false;
    Dictionary masked;
    std::size_t removed = 0;
    for (const auto& [key, value] : dictionary) {
        const std::optional<PropertyForm> own = formOf(_kind, key);
        if (!own && !_options.keepsUnknown) {
            const std::string name =
                std::string(removedText) + (removed == 0 ? "" : " " + std::to_string(removed + 1));
            ++removed;
            const std::string* const text = value.asString();
            if (key != name || !text || *text != removedText) {
                _report.add(Masked::UnknownKey);
                changed = true;
            }
            masked.set(name, removedText);
            continue;
        }
        const bool isInherited = !own || *own == Inner || (classOf(context.form) && !classOf(*own));
        Value each = value;
        changed = maskValue(each, {isInherited ? context.form : *own, context.cell}) || changed;
        masked.set(key, each.isNone() ? Value(removedText) : std::move(each));
    }
    if (changed)
        dictionary = std::move(masked);
    return changed;
}

} // namespace velmora

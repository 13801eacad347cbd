// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/LookupWriter.h"

namespace velmora::C2K {

template <class Put>
void LookupWriter::forEachTarget(std::string_view valueKey, Put put) const {
    const Array* const targets = _lookup[valueKey].asArray();
    if (!targets)
        return;
    for (const Value& target : *targets) {
        const Dictionary* const entries = target.asDictionary();
        const std::string* const label = entries ? (*entries)["key"].asString() : nullptr;
        Dictionary* const display = entries ? (*entries)["dict"].asDictionary() : nullptr;
        if (!label || !display || display->isFrozen())
            return;
        put(*display, *label);
    }
}

void LookupWriter::publishText(std::string_view valueKey, std::string_view text) {
    forEachTarget(valueKey,
                  [text](Dictionary& display, std::string_view label) { display.setText(label, text); });
}

void LookupWriter::publish(std::string_view valueKey, const Value& value) {
    forEachTarget(valueKey,
                  [&value](Dictionary& display, std::string_view label) { display.set(label, value); });
}

} // namespace velmora::C2K

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Model/DisplayTechnology.h"

namespace velmora {

namespace {

/// Whether both are one node; of displays that are no node, whether they show the same.
bool isSameDisplay(const Value& a, const Value& b) {
    if (a.asDictionary() || a.asArray())
        return a.asDictionary() == b.asDictionary() && a.asArray() == b.asArray();
    return a == b;
}

} // namespace

void DisplayTechnology::setDecoder(std::string_view technology, const Dictionary& state) {
    _earlierTechnology = ofDisplay(state);
    _earlierDisplay = state["Display"];
    _technology = technology;
}

std::string DisplayTechnology::ofDisplay(const Dictionary& state) const {
    const Value& display = state["Display"];
    if (display.isNone())
        return {};
    return isSameDisplay(display, _earlierDisplay) ? _earlierTechnology : _technology;
}

} // namespace velmora

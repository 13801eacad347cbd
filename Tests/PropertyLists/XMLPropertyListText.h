// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/PropertyList.h"
#include "Tests/PropertyLists/PropertyListSamples.h"

#include <string>
#include <string_view>

namespace velmora {

/// What the reader makes of the text.
inline Result<Value> readText(std::string_view text, const PropertyListLimits& limits = {}) {
    const auto bytes = bytesOf(text);
    return readPropertyList(bytes, limits);
}

/// A complete document of one value.
inline std::string plist(const std::string& value) {
    return "<plist version=\"1.0\">" + value + "</plist>";
}

} // namespace velmora

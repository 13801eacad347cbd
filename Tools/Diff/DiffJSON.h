// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"
#include "Tools/Text/JSONText.h"

#include <string>

namespace velmora {

/// The object's text, indented, with a line feed at its end.
[[nodiscard]] inline std::string jsonText(const Value& object) {
    TextBuffer text;
    appendIndentedJson(text, object);
    text.append('\n');
    return std::string(text.view());
}

} // namespace velmora

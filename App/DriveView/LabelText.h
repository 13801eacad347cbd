// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Label.h"

#include <string_view>

namespace velmora {

/// Sets the text of a label where it is another one: a label that shows what it showed is not drawn again.
inline void changeText(Label& label, std::string_view text) {
    if (label.text() != text)
        label.setText(text);
}

/// The same of its name for screen readers, which announce a new one.
inline void changeName(View& view, std::string_view name) {
    if (view.accessibleName() != name)
        view.setAccessibleName(name);
}

} // namespace velmora

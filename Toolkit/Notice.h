// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>
#include <string>

namespace velmora {

/// What a bar above the panes says, with a button for what can be done about it.
struct Notice {
    std::string text;  ///< plain; empty for no bar
    std::string title; ///< the button's; empty for none
    std::function<void()> action;
};

} // namespace velmora

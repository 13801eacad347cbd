// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Bars/ToolbarItem.h"

#include <functional>

namespace velmora {

/// The standard Save button: "Save", also pressed by Ctrl-S while its screen is on top.
class SaveButton : public ToolbarItem {
public:
    explicit SaveButton(std::function<void()> action);
    /// What a click does. The action may replace the toolbar's items.
    void press() const;

private:
    std::function<void()> _action;
};

} // namespace velmora

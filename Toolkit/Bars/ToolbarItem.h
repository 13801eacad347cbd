// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>

namespace velmora {

class Toolbar;

/// Something in a screen's toolbar. Items describe what is shown; the toolbar draws it, and when a screen
/// replaces its items by similar ones it keeps their widgets: a spinning indicator continues, a focused or
/// half pressed button stays so. Items are shared by their creator and the view controller; an item is in one
/// toolbar at a time.
class ToolbarItem {
public:
    virtual ~ToolbarItem() = default;
    ToolbarItem(const ToolbarItem&) = delete;
    ToolbarItem& operator=(const ToolbarItem&) = delete;

protected:
    ToolbarItem() = default;
    /// Redraws the item in the toolbar that shows it, if any.
    void changed() const {
        if (_onChange)
            _onChange();
    }

private:
    friend class Toolbar;
    std::function<void()> _onChange;
};

} // namespace velmora

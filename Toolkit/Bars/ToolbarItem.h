// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>

namespace velmora {

class Toolbar;

/// Something in a screen's toolbar. Items say what is to be shown; the toolbar that shows them draws it, and
/// when a screen replaces its items by like ones it keeps what it has drawn: a spinning indicator turns on, a
/// focused or half pressed button stays so. Items are shared between whoever makes them and the view
/// controller they are set on; one item stands in one toolbar at a time.
class ToolbarItem {
public:
    virtual ~ToolbarItem() = default;
    ToolbarItem(const ToolbarItem&) = delete;
    ToolbarItem& operator=(const ToolbarItem&) = delete;

protected:
    ToolbarItem() = default;
    /// Has the toolbar that shows the item, if any, draw it anew.
    void changed() const {
        if (_onChange)
            _onChange();
    }

private:
    friend class Toolbar;
    std::function<void()> _onChange;
};

} // namespace velmora

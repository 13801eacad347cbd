// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Bars/ToolbarItem.h"

namespace velmora {

/// A grey wheel that spins while something is under way. Stopped, it is hidden and costs nothing (but keeps
/// its place when told not to hide). Where the user wants no motion it stands still.
class BusyIndicator : public ToolbarItem {
public:
    void startAnimating();
    void stopAnimating();
    [[nodiscard]] bool isAnimating() const { return _isAnimating; }
    /// True at first.
    void setHidesWhenStopped(bool hides);
    [[nodiscard]] bool hidesWhenStopped() const { return _hidesWhenStopped; }

private:
    bool _isAnimating = false;
    bool _hidesWhenStopped = true;
};

} // namespace velmora

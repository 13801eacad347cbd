// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Bars/ToolbarItem.h"

namespace velmora {

/// A grey wheel that spins while something is in progress. Stopped, it is hidden and costs nothing (unless it
/// is set not to hide). With reduced motion it does not spin.
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

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

namespace velmora {

class NavigationController;
class ViewController;

/// Receives the changes of a navigation stack's screen. Outlives the stack's use of it.
class NavigationControllerDelegate {
public:
    virtual ~NavigationControllerDelegate() = default;
    /// The controller's view is about to be shown: pushed, uncovered by a pop of whatever kind (the user's
    /// back button and keys among them), or the stack's first when the stack itself comes onto the screen.
    /// Called after the old screen's `viewWillDisappear` and before the new one's `viewWillAppear`; the
    /// controller is the stack's top already. The default does nothing.
    virtual void willShowViewController(NavigationController& navigationController,
                                        ViewController& viewController, bool animated);
};

} // namespace velmora

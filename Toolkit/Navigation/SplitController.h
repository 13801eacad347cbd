// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Navigation/ViewController.h"

#include <functional>
#include <memory>

namespace velmora {

/// Two screens in one window. Where it is wide enough the second stands beside the first, which keeps to a
/// width that suits lists; otherwise one of the two has all of it. The second one's view is made when it is
/// first shown. Holds both.
class SplitController : public ViewController {
public:
    /// A window of that width shows both.
    static constexpr double leastWidthOfBoth = 720;
    /// The most that the first one has then.
    static constexpr double greatestWidthOfFirst = 480;

    SplitController(std::shared_ptr<ViewController> first, std::shared_ptr<ViewController> second);
    ~SplitController() override;

    /// Shows the second one, beside the first or in its place, or not.
    void setSecondShown(bool isShown);
    [[nodiscard]] bool isSecondShown() const { return _isSecondShown; }
    /// Whether the window has room for both.
    [[nodiscard]] bool isWide() const;
    /// Called when the window has become wide, or is not any more.
    void setOnWidthChanged(std::function<void()> changed) { _onWidthChanged = std::move(changed); }

    void viewWillAppear(bool animated) override;
    void viewDidAppear(bool animated) override;
    void viewWillDisappear(bool animated) override;
    void viewDidDisappear(bool animated) override;
    /// That of the screen that has the keyboard focus.
    bool becomeFirstResponder() override;
    void cancelOperation() override;
    void saveOperation() override;

protected:
    [[nodiscard]] std::unique_ptr<View> loadView() override;

private:
    class SplitView;
    struct Side {
        std::shared_ptr<ViewController> controller;
        bool isShown = false;
    };

    void update();
    void show(Side& side, bool isShown);
    void layout();
    [[nodiscard]] ViewController& focused() const;

    Side _first;
    Side _second;
    bool _isSecondShown = false;
    bool _isOnScreen = false;
    bool _hasAppeared = false;
    bool _wasWide = false;
    std::function<void()> _onWidthChanged;
};

} // namespace velmora

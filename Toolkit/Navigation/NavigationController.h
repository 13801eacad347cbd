// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Navigation/NavigationControllerDelegate.h"
#include "Toolkit/Navigation/ViewController.h"
#include "Toolkit/Notice.h"

#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace velmora {

class NavigationView;

/// A stack of screens ("panes"), of which the top one shows, between a header (title, back button) above and,
/// unless hidden, the top pane's toolbar below. The stack holds its panes. Operations change the stack
/// immediately; only the drawing is animated, and only without reduced motion. An operation ends the
/// animation of the previous one.
///
/// Escape, Alt-Left and the back key of a device pop the top pane.
class NavigationController : public ViewController {
public:
    /// Throws std::invalid_argument for no root.
    explicit NavigationController(std::shared_ptr<ViewController> rootViewController);
    ~NavigationController() override;

    /// Not owned; null for none.
    void setDelegate(NavigationControllerDelegate* delegate);

    /// Throws std::invalid_argument for null or a controller that is on a stack already.
    void pushViewController(std::shared_ptr<ViewController> viewController, bool animated);
    /// Pops the top pane and returns it; null when it is the root, which stays.
    std::shared_ptr<ViewController> popViewController(bool animated);
    /// Pops all panes above the given one and returns them, bottom first; none when that one is on top or not
    /// on the stack. Only the uncovered pane is shown, none of those between.
    std::vector<std::shared_ptr<ViewController>> popToViewController(const ViewController& viewController,
                                                                     bool animated);

    [[nodiscard]] std::shared_ptr<ViewController> topViewController() const;
    /// Bottom first.
    [[nodiscard]] const std::vector<std::shared_ptr<ViewController>>& viewControllers() const {
        return _panes;
    }

    /// True at first.
    [[nodiscard]] bool isToolbarHidden() const { return _isToolbarHidden; }
    void setToolbarHidden(bool isHidden, bool animated = false);
    /// What the bar between header and pane says, on whatever pane; none at first.
    void setNotice(Notice notice);
    [[nodiscard]] const Notice& notice() const { return _notice; }
    /// Views between pane and toolbar, on whatever pane, the first on top; none at first. Not owned.
    void setAccessories(std::vector<View*> views);

    /// A button in the header of every pane; none at first, and for an empty title.
    void setHeaderCommand(std::string title, std::function<void()> action);
    /// What the back button leads to from the root pane, and how; without a title there is none. Escape and
    /// the like do the same.
    void setLeave(std::string title, std::function<void()> action);
    /// Whether the top pane's title is also the window's; it is at first.
    void setNamesWindow(bool namesWindow) { _namesWindow = namesWindow; }

    void viewWillAppear(bool animated) override;
    void viewDidAppear(bool animated) override;
    void viewWillDisappear(bool animated) override;
    void viewDidDisappear(bool animated) override;
    /// The top pane's.
    bool becomeFirstResponder() override;
    /// Pops.
    void cancelOperation() override;
    /// Presses the toolbar's Save button.
    void saveOperation() override;

protected:
    [[nodiscard]] std::unique_ptr<View> loadView() override;

private:
    friend class ViewController;

    [[nodiscard]] NavigationView& stackView();
    /// Replaces the old pane by the top one.
    void showTop(const std::shared_ptr<ViewController>& old, bool isPush, bool animated);
    void announceTop(bool animated);
    void fillBars(bool animated);
    void viewControllerChanged(const ViewController& viewController);

    std::vector<std::shared_ptr<ViewController>> _panes;
    NavigationControllerDelegate* _delegate = nullptr;
    /// A title and what it does.
    struct Command {
        std::string title;
        std::function<void()> action;
    };

    void goBack();

    Notice _notice;
    std::vector<View*> _accessories;
    Command _headerCommand;
    Command _leave;
    bool _namesWindow = true;
    bool _isToolbarHidden = true;
    bool _isOnScreen = false;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Bars/ToolbarItem.h"
#include "Toolkit/View.h"

#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

class ModalPresentation;
class NavigationController;

/// One screen: creates its view lazily, and is notified when it appears and disappears. View controllers are
/// shared (std::make_shared): a navigation stack holds those on it, a presenter the one it presents, a window
/// its root. A controller owns its view.
class ViewController : public std::enable_shared_from_this<ViewController> {
public:
    ViewController();
    virtual ~ViewController();
    ViewController(const ViewController&) = delete;
    ViewController& operator=(const ViewController&) = delete;

    /// Made on first use: `loadView`, then `viewDidLoad`.
    [[nodiscard]] View& view();
    [[nodiscard]] bool isViewLoaded() const { return _view != nullptr; }

    /// The base's notices do nothing; a subclass forwards them or not as it likes.
    virtual void viewDidLoad();
    virtual void viewWillAppear(bool animated);
    /// After the animation that shows the screen.
    virtual void viewDidAppear(bool animated);
    virtual void viewWillDisappear(bool animated);
    virtual void viewDidDisappear(bool animated);
    /// Never sent: the toolkit keeps a view as long as its controller. Kept for subclasses that forward them.
    virtual void viewDidUnload();
    virtual void didReceiveMemoryWarning();

    /// What the header shows while the controller is on top of a stack, and the window list with it.
    [[nodiscard]] const std::string& title() const { return _title; }
    void setTitle(std::string_view title);

    /// The toolbar of the navigation stack while the controller is on top.
    [[nodiscard]] const std::vector<std::shared_ptr<ToolbarItem>>& toolbarItems() const {
        return _toolbarItems;
    }
    void setToolbarItems(std::vector<std::shared_ptr<ToolbarItem>> items, bool animated);

    /// The stack that the controller is on, or null.
    [[nodiscard]] NavigationController* navigationController() const { return _navigationController; }

    /// Shows the other controller's view as a sheet over the window that this one is in; nothing below it can
    /// be used until it is dismissed. The controllers below are not notified. Throws std::logic_error when
    /// this one presents another already or its view is in no window.
    void presentModalViewController(std::shared_ptr<ViewController> viewController, bool animated);
    /// Dismisses the presented controller; called on a presented controller, it dismisses that one itself.
    /// The controller is released once it is off the screen. Does nothing when there is none.
    void dismissModalViewController(bool animated);
    /// The one that this one presents, or null.
    [[nodiscard]] std::shared_ptr<ViewController> modalViewController() const;
    [[nodiscard]] ViewController* presentingViewController() const { return _presenter; }

    /// Escape, while the controller is presented. The base presses the view's cancel button or, without one,
    /// dismisses the controller.
    virtual void cancelOperation();
    /// Ctrl-S. The base presses the view's save button, if it has one.
    virtual void saveOperation();

    /// Takes the keyboard for the view.
    virtual bool becomeFirstResponder();
    /// Releases the keyboard focus if the view or a subview has it.
    virtual bool resignFirstResponder();

protected:
    /// Makes the view; a plain one unless overridden.
    [[nodiscard]] virtual std::unique_ptr<View> loadView();

private:
    friend class NavigationController;
    friend class ModalPresentation;
    std::unique_ptr<View> _view;
    std::string _title;
    std::vector<std::shared_ptr<ToolbarItem>> _toolbarItems;
    NavigationController* _navigationController = nullptr;
    ViewController* _presenter = nullptr;
    std::shared_ptr<ModalPresentation> _presentation;
};

} // namespace velmora

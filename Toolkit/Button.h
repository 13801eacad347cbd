// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/View.h"

#include <functional>
#include <string>

namespace velmora {

enum class ButtonRole {
    plain,
    save,  ///< the screen's main action: stands out, Ctrl-S presses it
    cancel ///< leaves a modal screen: Escape presses it
};

/// A push button with a title and an action. The action may destroy the button.
class Button : public View {
public:
    explicit Button(std::string_view title, ButtonRole role = ButtonRole::plain);
    ~Button() override;

    void setAction(std::function<void()> action);
    [[nodiscard]] std::string title() const;
    [[nodiscard]] ButtonRole role() const;
    void setEnabled(bool isEnabled);
    /// A button that is on or off, which each press changes before its action. Off at first.
    void setTogglable(bool isTogglable);
    [[nodiscard]] bool isOn() const;
    void setOn(bool isOn);
    /// Does what a click does, unless the button is disabled.
    void press();
    /// Wide enough for the title, high enough for a finger.
    void sizeToFit() override;

private:
    class Widget;
    Widget* _button;
    ButtonRole _role;
};

} // namespace velmora

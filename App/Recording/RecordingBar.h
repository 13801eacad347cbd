// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Button.h"
#include "Toolkit/Label.h"
#include "Toolkit/TextField.h"
#include "Toolkit/TextFieldDelegate.h"
#include "Toolkit/View.h"

#include <functional>
#include <string>

namespace velmora {

/// The bar of a recording that is being made: what has been recorded, and buttons for a note and to stop. A
/// note is typed in the bar. Main thread only.
class RecordingBar final : public View, public TextFieldDelegate {
public:
    struct Actions {
        std::function<void()> stop;
        std::function<void(const std::string& text)> note;
    };

    explicit RecordingBar(Actions actions);

    void setStatus(const std::string& status);
    /// Puts the field for a note in place of the status, with the keyboard in it.
    void askNote();

    [[nodiscard]] TextField& noteField() { return _field; }
    [[nodiscard]] Label& status() { return _status; }

    void layoutSubviews() override;
    bool textFieldShouldReturn(TextField& textField) override;

private:
    void showField(bool isShown);
    /// Takes what the field holds, where that is more than blanks, and closes it.
    void takeNote();

    Actions _actions;
    Label _status;
    TextField _field;
    Button _note{"Note"};
    Button _stop{"Stop"};
};

} // namespace velmora

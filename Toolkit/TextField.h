// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/View.h"

#include <string>

namespace velmora {

class TextFieldDelegate;

/// A field for one line of text. `becomeFirstResponder` puts the cursor (and a touch device's keyboard)
/// there, `resignFirstResponder` takes them away.
class TextField : public View {
public:
    TextField();
    ~TextField() override;

    [[nodiscard]] std::string text() const;
    void setText(std::string_view text);
    /// The empty field's hint; also the field's accessible name.
    void setPlaceholder(std::string_view text);
    /// Not owned; null for none.
    void setDelegate(TextFieldDelegate* delegate);
    /// The height of a touchable field with the system font; the width stays.
    void sizeToFit() override;

private:
    class Widget;
    Widget* _field;
    TextFieldDelegate* _delegate = nullptr;
};

} // namespace velmora

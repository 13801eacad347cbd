// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

namespace velmora {

class TextField;

/// Decides for a text field. Outlives the field, or removes itself from it.
class TextFieldDelegate {
public:
    virtual ~TextFieldDelegate() = default;
    /// The return key was pressed. True lets the field do what it does on return (nothing more, at present).
    virtual bool textFieldShouldReturn(TextField& textField) = 0;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Bars/ToolbarItem.h"
#include "Toolkit/Color.h"
#include "Toolkit/Font.h"

#include <string>

namespace velmora {

/// A text in a toolbar, as wide as it needs; where the toolbar has less room it begins with an ellipsis.
/// Starts with the system font of size 14, dark text, clear background.
class LabelItem : public ToolbarItem {
public:
    explicit LabelItem(std::string text = {});

    [[nodiscard]] const std::string& text() const { return _text; }
    void setText(std::string text);
    [[nodiscard]] const Font& font() const { return _font; }
    void setFont(const Font& font);
    [[nodiscard]] Color textColor() const { return _textColor; }
    void setTextColor(Color color);
    [[nodiscard]] Color backgroundColor() const { return _backgroundColor; }
    void setBackgroundColor(Color color);

private:
    std::string _text;
    Font _font = Font::systemFontOfSize(14);
    Color _textColor = Color::darkText;
    Color _backgroundColor = Color::clear;
};

} // namespace velmora

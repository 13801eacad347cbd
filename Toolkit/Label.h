// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Font.h"
#include "Toolkit/View.h"

#include <string>

namespace velmora {

class LabelWidget;

/// Left is where lines begin: on the right in a layout from right to left.
enum class TextAlignment { left, center, right };

/// One line of plain text, in the middle of its frame's height. Text that does not fit ends in an ellipsis.
/// Starts with the system font of size 17, left-aligned, without a background.
class Label : public View {
public:
    Label();
    explicit Label(std::string_view text);
    ~Label() override;

    [[nodiscard]] std::string text() const;
    void setText(std::string_view text);
    [[nodiscard]] const Font& font() const;
    void setFont(const Font& font);
    void setTextColor(Color color);
    [[nodiscard]] TextAlignment textAlignment() const;
    void setTextAlignment(TextAlignment alignment);
    /// Whether screen readers take it for a heading; not at first.
    void setHeading(bool isHeading);

    /// The size of the text in the font.
    void sizeToFit() override;

private:
    LabelWidget* _label;
    Font _font;
    TextAlignment _alignment = TextAlignment::left;
};

} // namespace velmora

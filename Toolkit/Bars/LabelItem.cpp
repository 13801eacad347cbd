// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Bars/LabelItem.h"

#include <utility>

namespace velmora {

LabelItem::LabelItem(std::string text) : _text(std::move(text)) {}

void LabelItem::setText(std::string text) {
    _text = std::move(text);
    changed();
}

void LabelItem::setFont(const Font& font) {
    _font = font;
    changed();
}

void LabelItem::setTextColor(Color color) {
    _textColor = color;
    changed();
}

void LabelItem::setBackgroundColor(Color color) {
    _backgroundColor = color;
    changed();
}

} // namespace velmora

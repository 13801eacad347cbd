// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Label.h"

#include "Toolkit/Widgets/Conversions.h"
#include "Toolkit/Widgets/Text/LabelWidget.h"

namespace velmora {

Label::Label() : Label(std::string_view()) {}

Label::Label(std::string_view text)
    : View(new LabelWidget), _label(static_cast<LabelWidget*>(widget())), _font(Font::systemFontOfSize(17)) {
    _label->setFont(toQt(_font));
    setText(text);
}

Label::~Label() = default;

std::string Label::text() const {
    return fromQt(_label->text());
}

void Label::setText(std::string_view text) {
    _label->setText(toQt(text));
}

const Font& Label::font() const {
    return _font;
}

void Label::setFont(const Font& font) {
    if (font == _font)
        return;
    _font = font;
    _label->setFont(toQt(font));
}

void Label::setTextColor(Color color) {
    _label->setTextColor(color);
}

TextAlignment Label::textAlignment() const {
    return _alignment;
}

void Label::setTextAlignment(TextAlignment alignment) {
    _alignment = alignment;
    const Qt::Alignment horizontal = alignment == TextAlignment::left     ? Qt::AlignLeft
                                     : alignment == TextAlignment::center ? Qt::AlignHCenter
                                                                          : Qt::AlignRight;
    _label->setAlignment(horizontal | Qt::AlignVCenter);
}

void Label::setHeading(bool isHeading) {
    _label->setHeading(isHeading);
}

void Label::sizeToFit() {
    const Size size = sizeOfText(text(), _font);
    setFrame({frame().x, frame().y, size.width, size.height});
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Button.h"

#include "Toolkit/Widgets/Conversions.h"

#include <QPushButton>

#include <algorithm>
#include <utility>

namespace velmora {

class Button::Widget : public QPushButton {
public:
    std::function<void()> action;
};

Button::Button(std::string_view title, ButtonRole role)
    : View(new Widget), _button(static_cast<Widget*>(widget())), _role(role) {
    _button->setText(toQt(title).replace(u'&', QStringLiteral("&&")));
    _button->setAutoDefault(true); // Enter presses it, as Space does
    if (role == ButtonRole::save) {
        QFont font = _button->font();
        font.setBold(true);
        _button->setFont(font);
    }
    _button->setObjectName(role == ButtonRole::save     ? "velmora.saveButton"
                           : role == ButtonRole::cancel ? "velmora.cancelButton"
                                                        : "velmora.button");
    QObject::connect(_button, &QPushButton::clicked, _button, [button = _button] {
        const std::function<void()> action = button->action;
        if (action)
            action();
    });
}

Button::~Button() {
    _button->action = nullptr;
}

void Button::setAction(std::function<void()> action) {
    _button->action = std::move(action);
}

std::string Button::title() const {
    return fromQt(_button->text().replace(QStringLiteral("&&"), QStringLiteral("&")));
}

ButtonRole Button::role() const {
    return _role;
}

void Button::setEnabled(bool isEnabled) {
    _button->setEnabled(isEnabled);
}

void Button::setTogglable(bool isTogglable) {
    _button->setCheckable(isTogglable);
    // Some palettes have hardly another colour for it.
    QObject::connect(_button, &QPushButton::toggled, _button, [button = _button](bool isOn) {
        QFont font = button->font();
        font.setBold(isOn);
        font.setUnderline(isOn);
        button->setFont(font);
    });
}

bool Button::isOn() const {
    return _button->isChecked();
}

void Button::setOn(bool isOn) {
    _button->setChecked(isOn);
}

void Button::press() {
    _button->click();
}

void Button::sizeToFit() {
    const QSize hint = _button->sizeHint();
    setFrame({frame().x, frame().y, std::max(88.0, static_cast<double>(hint.width())),
              std::max(44.0, static_cast<double>(hint.height()))});
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/TextField.h"

#include "Toolkit/TextFieldDelegate.h"
#include "Toolkit/Widgets/Conversions.h"

#include <QKeyEvent>
#include <QLineEdit>

#include <algorithm>

namespace velmora {

class TextField::Widget : public QLineEdit {
protected:
    void keyPressEvent(QKeyEvent* event) override {
        QLineEdit::keyPressEvent(event);
        // Otherwise the same press would go on to the screen's default button.
        if (event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter)
            event->accept();
    }
};

TextField::TextField() : View(new Widget), _field(static_cast<Widget*>(widget())) {
    _field->setObjectName("velmora.textField");
    QObject::connect(_field, &QLineEdit::returnPressed, _field, [this] {
        if (_delegate)
            (void)_delegate->textFieldShouldReturn(*this);
    });
}

TextField::~TextField() {
    _field->disconnect();
}

std::string TextField::text() const {
    return fromQt(_field->text());
}

void TextField::setText(std::string_view text) {
    _field->setText(toQt(text));
}

void TextField::setPlaceholder(std::string_view text) {
    _field->setPlaceholderText(toQt(text));
    setAccessibleName(text);
}

void TextField::setDelegate(TextFieldDelegate* delegate) {
    _delegate = delegate;
}

void TextField::sizeToFit() {
    setFrame({frame().x, frame().y, frame().width,
              std::max(44.0, static_cast<double>(_field->sizeHint().height()))});
}

} // namespace velmora

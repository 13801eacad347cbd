// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Alert.h"

#include "Toolkit/Widgets/Conversions.h"
#include "Toolkit/Widgets/WindowWidget.h"

#include <QMessageBox>
#include <QPushButton>

#include <utility>

namespace velmora {

Alert::Alert(std::string title, std::string message, std::string buttonTitle)
    : _title(std::move(title)), _message(std::move(message)), _buttonTitle(std::move(buttonTitle)) {}

void Alert::show() const {
    auto* const box = new QMessageBox(WindowWidget::main());
    box->setObjectName("velmora.alert");
    box->setAttribute(Qt::WA_DeleteOnClose);
    box->setIcon(QMessageBox::Warning);
    box->setTextFormat(Qt::PlainText);
    box->setWindowTitle(toQt(_title));
    box->setText(toQt(_title));
    box->setInformativeText(toQt(_message));
    QPushButton* const button = box->addButton(toQt(_buttonTitle), QMessageBox::AcceptRole);
    button->setMinimumSize(88, 44);
    box->setDefaultButton(button);
    box->setEscapeButton(button);
    box->open(); // returns at once
}

} // namespace velmora

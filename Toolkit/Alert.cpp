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

void Alert::addAnswer(std::string title, std::function<void()> answered) {
    _answers.push_back({std::move(title), std::move(answered)});
}

void Alert::show() const {
    auto* const box = new QMessageBox(WindowWidget::main());
    box->setObjectName("velmora.alert");
    box->setAttribute(Qt::WA_DeleteOnClose);
    box->setIcon(_answers.empty() ? QMessageBox::Warning : QMessageBox::Question);
    box->setTextFormat(Qt::PlainText);
    box->setWindowTitle(toQt(_title));
    box->setText(toQt(_title));
    box->setInformativeText(toQt(_message));
    const auto add = [box](const std::string& title, QMessageBox::ButtonRole role) {
        QPushButton* const button = box->addButton(toQt(title), role);
        button->setMinimumSize(88, 44);
        return button;
    };
    QPushButton* chosen = nullptr;
    for (const Answer& each : _answers) {
        QPushButton* const button = add(each.title, QMessageBox::AcceptRole);
        QObject::connect(button, &QPushButton::clicked, box, [answered = each.answered] { answered(); });
        if (!chosen)
            chosen = button;
    }
    QPushButton* const closing =
        add(_buttonTitle, _answers.empty() ? QMessageBox::AcceptRole : QMessageBox::RejectRole);
    box->setDefaultButton(chosen ? chosen : closing);
    box->setEscapeButton(closing);
    box->open(); // returns at once
}

} // namespace velmora

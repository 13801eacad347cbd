// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QWidget>

namespace velmora {

class BackButton;
class CommandButton;
class LabelWidget;

/// The bar on top of a navigation stack.
class HeaderBar : public QWidget {
public:
    HeaderBar();

    [[nodiscard]] BackButton& backButton() { return *_back; }
    void setTitle(const QString& title);
    /// Shows the way back to a screen of that title.
    void setBack(bool isShown, const QString& title);
    [[nodiscard]] CommandButton& commandButton() { return *_command; }
    /// Shows a button of that title; none for an empty one.
    void setCommand(const QString& title);
    /// Takes that width, and returns the height that the title needs in it.
    [[nodiscard]] int fitWidth(int width);

protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    void layoutParts();

    BackButton* _back;
    CommandButton* _command;
    LabelWidget* _title;
};

} // namespace velmora

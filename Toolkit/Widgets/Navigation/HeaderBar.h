// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Widgets/Text/LabelWidget.h"

#include <QAbstractButton>
#include <QWidget>

namespace velmora {

/// The way back: a chevron and the title of the screen below, as far as there is room.
class BackButton : public QAbstractButton {
public:
    explicit BackButton(QWidget* parent);
    [[nodiscard]] QSize sizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
};

/// A command of the screen, at the right edge of the bar.
class HeaderButton : public QAbstractButton {
public:
    explicit HeaderButton(QWidget* parent);
    [[nodiscard]] QSize sizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
};

/// The title of a screen, which a screen reader takes for a heading.
class HeadingLabel : public LabelWidget {};

/// The bar on top of a navigation stack.
class HeaderBar : public QWidget {
public:
    HeaderBar();

    [[nodiscard]] BackButton& backButton() { return *_back; }
    void setTitle(const QString& title);
    /// Shows the way back to a screen of that title.
    void setBack(bool isShown, const QString& title);
    [[nodiscard]] HeaderButton& commandButton() { return *_command; }
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
    HeaderButton* _command;
    HeadingLabel* _title;
};

} // namespace velmora

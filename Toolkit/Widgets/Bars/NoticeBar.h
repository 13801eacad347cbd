// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Notice.h"

#include <QWidget>

class QPushButton;

namespace velmora {

class WrappedLabel;

/// A notice: its text and, right of it or where that leaves too little room below it, its button. Screen
/// readers hear of a new text as of an alert.
class NoticeBar : public QWidget {
public:
    NoticeBar();

    /// Shows the bar unless the notice has no text.
    void setNotice(const Notice& notice);
    [[nodiscard]] int heightForWidth(int width) const override;

protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    /// Whether the button is beside the text in a bar of that width.
    [[nodiscard]] bool isBeside(int width) const;
    [[nodiscard]] int textWidth(int width) const;

    WrappedLabel* _text;
    QPushButton* _button;
    std::function<void()> _action;
};

} // namespace velmora

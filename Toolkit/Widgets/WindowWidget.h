// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QWidget>

#include <functional>

class QKeyEvent;

namespace velmora {

class SheetWidget;

/// A window of the program. Keys that nobody in it uses come here.
class WindowWidget : public QWidget {
public:
    WindowWidget();

    std::function<void()> onResize;
    std::function<void()> onCancel;
    std::function<void()> onSave;
    /// Gives the keyboard to whom it belongs when nobody has it.
    std::function<void()> onFocus;

    /// The topmost sheet that is not on its way out, or null.
    [[nodiscard]] SheetWidget* sheet() const;
    /// Gives the keyboard back to who had it before a sheet came, or to whom it belongs.
    void returnFocus(QWidget* before);

    /// The active window of the program, or else any that is on the screen; null when there is none.
    [[nodiscard]] static WindowWidget* main();
    [[nodiscard]] static bool isBackOrCancel(const QKeyEvent& event);

protected:
    void keyPressEvent(QKeyEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QWidget>

#include <functional>

class QKeyEvent;

namespace velmora {

class SheetWidget;

/// A window of the program. Receives the keys that none of its children uses.
class WindowWidget : public QWidget {
public:
    WindowWidget();

    std::function<void()> onResize;
    std::function<void()> onCancel;
    std::function<void()> onSave;
    /// Sets the default keyboard focus when no widget has it.
    std::function<void()> onFocus;

    /// The topmost sheet that is not closing, or null.
    [[nodiscard]] SheetWidget* sheet() const;
    /// Restores the keyboard focus of before the sheet, or the default focus.
    void returnFocus(QWidget* before);

    /// The active window of the program, or else any that is on the screen; null when there is none.
    [[nodiscard]] static WindowWidget* main();
    [[nodiscard]] static bool isBackOrCancel(const QKeyEvent& event);

protected:
    void keyPressEvent(QKeyEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
};

} // namespace velmora

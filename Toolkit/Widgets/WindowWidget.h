// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QWidget>

#include <functional>
#include <map>
#include <string>

class QKeyEvent;

namespace velmora {

class SheetWidget;

/// A window of the program. Receives the keys that none of its children uses.
class WindowWidget : public QWidget {
public:
    WindowWidget();

    struct ByCombination {
        bool operator()(QKeyCombination one, QKeyCombination other) const {
            return one.toCombined() < other.toCombined();
        }
    };

    std::function<void()> onResize;
    std::function<void()> onCancel;
    std::function<void()> onSave;
    /// Called for these keys, whatever has the keyboard focus.
    std::map<QKeyCombination, std::function<void()>, ByCombination> commands;
    /// Called once, when the window's contents are on the screen.
    std::function<void()> onPainted;
    /// Called with the path of a file that is dropped on the window.
    std::function<void(const std::string& path)> onDrop;
    /// Sets the default keyboard focus when no widget has it.
    std::function<void()> onFocus;

    /// The topmost sheet that is not closing, or null.
    [[nodiscard]] SheetWidget* sheet() const;
    /// Restores the keyboard focus of before the sheet, or the default focus.
    void returnFocus(QWidget* before);

    /// The active window of the program, or else any that is on the screen; null when there is none.
    [[nodiscard]] static WindowWidget* main();
    [[nodiscard]] static bool isBackOrCancel(const QKeyEvent& event);
    /// Calls the command of these keys; false where there is none.
    [[nodiscard]] bool runCommand(const QKeyEvent& event) const;

    /// Calls onPainted soon if the screen shows the window; else its first exposure does.
    void checkPainted();

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void dragEnterEvent(QDragEnterEvent* event) override;
    void dropEvent(QDropEvent* event) override;

private:
    void paintFirst();
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QWidget>

#include <functional>

namespace velmora {

class WindowWidget;

/// Covers a window with shade, for a sheet to lie on. What is below can't be reached by mouse, finger or
/// keys.
class SheetWidget : public QWidget {
public:
    explicit SheetWidget(WindowWidget& window);
    ~SheetWidget() override;

    std::function<void()> onResize;
    /// Called when the window is destroyed with this.
    std::function<void()> onDestroyed;
    std::function<void()> onCancel;
    /// Ctrl-S, and Enter where no widget of the sheet takes it.
    std::function<void()> onSave;

    /// 0 to 1.
    void setShade(double shade);
    /// While it closes: passes events through.
    void setPassive();
    [[nodiscard]] bool isPassive() const { return _isPassive; }
    void focusFirst();

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;
    bool event(QEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    bool focusNextPrevChild(bool next) override;

private:
    double _shade = 0;
    bool _isPassive = false;
};

} // namespace velmora

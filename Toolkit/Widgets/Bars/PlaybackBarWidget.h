// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Bars/PlaybackBar.h"

#include <QWidget>

#include <map>
#include <string>
#include <vector>

class QLineEdit;
class QMenu;
class QSlider;
class QStyle;
class QToolButton;

namespace velmora {

/// What a playback bar looks like. Its parts are found by object name: "velmora.playback" with
/// "velmora.playback.play", ".slider", ".time", ".speed", ".earlierMessage" and so on.
class PlaybackBarWidget : public QWidget {
public:
    explicit PlaybackBarWidget(const std::vector<std::string>& speeds);
    ~PlaybackBarWidget() override;

    void show(const PlaybackBar::Shown& shown);
    [[nodiscard]] bool hasHeightForWidth() const override { return true; }
    [[nodiscard]] int heightForWidth(int width) const override;

    PlaybackBar::Actions actions;

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    using Command = PlaybackBar::Command;

    QToolButton* addButton(const char* name, const QString& title, int icon, Command command);
    /// Shows the style's icon of that number, in the colour of text: styles have dark ones on any ground.
    void setSymbol(QToolButton& button, int icon) const;
    void addSpeeds(const std::vector<std::string>& speeds);
    void run(Command command) const;
    void takeTime();
    /// Places them in a row; returns where it ends.
    int place(const std::vector<QWidget*>& row, int x, int y) const;

    std::vector<QWidget*> _buttons; ///< each is a QToolButton
    QToolButton* _play = nullptr;
    QSlider* _slider;
    QLineEdit* _time;
    QToolButton* _speed;
    std::vector<QString> _speeds;
    PlaybackBar::Shown _shown;
};

} // namespace velmora

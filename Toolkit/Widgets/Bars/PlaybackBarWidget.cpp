// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Bars/PlaybackBarWidget.h"

#include "Toolkit/Widgets/Conversions.h"
#include "Toolkit/Widgets/WindowWidget.h"

#include <QAbstractButton>
#include <QApplication>
#include <QKeyEvent>
#include <QLineEdit>
#include <QMenu>
#include <QPainter>
#include <QSlider>
#include <QStyle>
#include <QToolButton>

#include <algorithm>
#include <cmath>
#include <optional>

namespace velmora {

namespace {

constexpr int rowHeight = 48;
constexpr int buttonSize = 44;
constexpr int speedWidth = 60;
constexpr int margin = 8;
/// With less room the slider has a row of its own.
constexpr int leastWidthOfOneRow = 640;
constexpr const char* symbolProperty = "velmora.symbol";
constexpr int sliderSteps = 10'000;

std::optional<PlaybackBar::Command> commandOf(const QKeyEvent& key) {
    using Command = PlaybackBar::Command;
    if ((key.modifiers() & ~(Qt::ShiftModifier | Qt::KeypadModifier)) != 0)
        return std::nullopt;
    switch (key.key()) {
    case Qt::Key_Space: return Command::PlayOrPause;
    case Qt::Key_Comma: return Command::EarlierMessage;
    case Qt::Key_Period: return Command::NextMessage;
    // What Shift makes of the two keys on most keyboards.
    case Qt::Key_Less:
    case Qt::Key_Semicolon: return Command::EarlierRefresh;
    case Qt::Key_Greater:
    case Qt::Key_Colon: return Command::NextRefresh;
    case Qt::Key_BracketLeft: return Command::EarlierEvent;
    case Qt::Key_BracketRight: return Command::NextEvent;
    default: return std::nullopt;
    }
}

} // namespace

PlaybackBarWidget::PlaybackBarWidget(const std::vector<std::string>& speeds)
    : _slider(new QSlider(Qt::Horizontal, this)), _time(new QLineEdit(this)), _speed(new QToolButton(this)) {
    setObjectName("velmora.playback");
    setAccessibleName(tr("Playback"));
    addButton("earlierRefresh", tr("Earlier refresh"), QStyle::SP_MediaSkipBackward, Command::EarlierRefresh);
    addButton("earlierMessage", tr("Earlier message"), QStyle::SP_MediaSeekBackward, Command::EarlierMessage);
    _play = addButton("play", tr("Play"), QStyle::SP_MediaPlay, Command::PlayOrPause);
    addButton("nextMessage", tr("Next message"), QStyle::SP_MediaSeekForward, Command::NextMessage);
    addButton("nextRefresh", tr("Next refresh"), QStyle::SP_MediaSkipForward, Command::NextRefresh);
    _slider->setObjectName("velmora.playback.slider");
    _slider->setAccessibleName(tr("Moment"));
    _slider->setRange(0, sliderSteps);
    _slider->setSingleStep(sliderSteps / 200);
    _slider->setPageStep(sliderSteps / 20);
    QObject::connect(_slider, &QSlider::valueChanged, this, [this](int value) {
        if (actions.seek)
            actions.seek(static_cast<double>(value) / sliderSteps);
    });
    _time->setObjectName("velmora.playback.time");
    _time->setAccessibleName(tr("Time"));
    _time->setFrame(false);
    QObject::connect(_time, &QLineEdit::returnPressed, this, [this] { takeTime(); });
    QObject::connect(_time, &QLineEdit::editingFinished, this, [this] { _time->setText(toQt(_shown.time)); });
    addSpeeds(speeds);
    qApp->installEventFilter(this);
}

PlaybackBarWidget::~PlaybackBarWidget() = default;

QToolButton* PlaybackBarWidget::addButton(const char* name, const QString& title, int icon, Command command) {
    auto* const button = new QToolButton(this);
    button->setObjectName(QString("velmora.playback.") + name);
    button->setAccessibleName(title);
    button->setToolTip(title);
    setSymbol(*button, icon);
    button->setAutoRaise(true);
    button->setAutoRepeat(command != Command::PlayOrPause);
    button->setFocusPolicy(Qt::StrongFocus);
    button->resize(buttonSize, buttonSize);
    QObject::connect(button, &QToolButton::clicked, this, [this, command] { run(command); });
    _buttons.push_back(button);
    return button;
}

void PlaybackBarWidget::setSymbol(QToolButton& button, int icon) const {
    button.setProperty(symbolProperty, icon);
    const QIcon given = style()->standardIcon(static_cast<QStyle::StandardPixmap>(icon));
    QPixmap symbol = given.pixmap(button.iconSize(), devicePixelRatioF());
    QPainter painter(&symbol);
    painter.setCompositionMode(QPainter::CompositionMode_SourceIn);
    painter.fillRect(QRectF(QPointF(), symbol.deviceIndependentSize()),
                     palette().color(QPalette::ButtonText));
    painter.end();
    button.setIcon(symbol);
}

void PlaybackBarWidget::changeEvent(QEvent* event) {
    QWidget::changeEvent(event);
    if (event->type() != QEvent::PaletteChange && event->type() != QEvent::StyleChange)
        return;
    for (QWidget* const each : _buttons)
        setSymbol(static_cast<QToolButton&>(*each), each->property(symbolProperty).toInt());
}

void PlaybackBarWidget::addSpeeds(const std::vector<std::string>& speeds) {
    auto* const menu = new QMenu(_speed);
    for (std::size_t i = 0; i < speeds.size(); ++i) {
        _speeds.push_back(toQt(speeds[i]));
        QObject::connect(menu->addAction(_speeds.back()), &QAction::triggered, this, [this, i] {
            if (actions.speed)
                actions.speed(i);
        });
    }
    _speed->setObjectName("velmora.playback.speed");
    _speed->setMenu(menu);
    _speed->setPopupMode(QToolButton::InstantPopup);
    _speed->setAutoRaise(true);
    _speed->setFocusPolicy(Qt::StrongFocus);
    _speed->resize(speedWidth, buttonSize);
}

void PlaybackBarWidget::run(Command command) const {
    if (actions.command)
        actions.command(command);
}

void PlaybackBarWidget::takeTime() {
    const bool isTaken = actions.typed && actions.typed(fromQt(_time->text()));
    if (isTaken)
        _slider->setFocus(Qt::OtherFocusReason);
    else
        _time->selectAll();
}

void PlaybackBarWidget::show(const PlaybackBar::Shown& shown) {
    const bool wasPlaying = _shown.isPlaying;
    _shown = shown;
    if (shown.isPlaying != wasPlaying) {
        const QString title = shown.isPlaying ? tr("Pause") : tr("Play");
        setSymbol(*_play, shown.isPlaying ? QStyle::SP_MediaPause : QStyle::SP_MediaPlay);
        _play->setAccessibleName(title);
        _play->setToolTip(title);
    }
    if (!_slider->isSliderDown()) {
        const QSignalBlocker blocker(_slider);
        _slider->setValue(static_cast<int>(std::lround(shown.part * sliderSteps)));
    }
    _slider->setAccessibleDescription(toQt(shown.time));
    if (!_time->hasFocus())
        _time->setText(toQt(shown.time));
    const QString& speed = _speeds.at(shown.speed);
    if (_speed->text() == speed)
        return;
    _speed->setText(speed);
    _speed->setAccessibleName(tr("Speed %1").arg(speed));
    _speed->setToolTip(_speed->accessibleName());
}

bool PlaybackBarWidget::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() != QEvent::KeyPress || !isVisible() || watched != window()->focusWidget())
        return QWidget::eventFilter(watched, event);
    const auto& key = static_cast<const QKeyEvent&>(*event);
    const auto command = commandOf(key);
    const auto* const frame = dynamic_cast<const WindowWidget*>(window());
    // A button has Space for itself, and a text field everything.
    const bool isUsed = qobject_cast<QLineEdit*>(watched) ||
                        (qobject_cast<QAbstractButton*>(watched) && key.key() == Qt::Key_Space);
    if (!command || isUsed || (frame && frame->sheet()))
        return QWidget::eventFilter(watched, event);
    if (!key.isAutoRepeat() || *command != Command::PlayOrPause)
        run(*command);
    return true;
}

int PlaybackBarWidget::heightForWidth(int width) const {
    return width < leastWidthOfOneRow ? 2 * rowHeight : rowHeight;
}

int PlaybackBarWidget::place(const std::vector<QWidget*>& row, int x, int y) const {
    for (QWidget* const each : row) {
        each->move(x, y + (rowHeight - each->height()) / 2);
        x += each->width();
    }
    return x;
}

void PlaybackBarWidget::resizeEvent(QResizeEvent* /*event*/) {
    const bool isOneRow = width() >= leastWidthOfOneRow;
    const int below = isOneRow ? 0 : rowHeight;
    const int buttons = place(_buttons, isOneRow ? margin : 0, below);
    const int speed = width() - _speed->width() - (isOneRow ? margin : 0);
    place({_speed}, speed, below);
    const int text = _time->fontMetrics().horizontalAdvance("0000-00-00 00:00:00") + 4 * margin;
    _time->resize(std::min(text, isOneRow ? text : speed - buttons), buttonSize);
    place({_time}, speed - _time->width(), below);
    const int left = isOneRow ? buttons + margin : margin;
    const int right = isOneRow ? _time->x() - margin : width() - margin;
    _slider->resize(std::max(right - left, 0), buttonSize);
    place({_slider}, left, 0);
}

void PlaybackBarWidget::paintEvent(QPaintEvent* /*event*/) {
    QPainter painter(this);
    QColor line = palette().color(QPalette::WindowText);
    line.setAlphaF(0.22F);
    painter.fillRect(QRectF(0, 0, width(), 1 / devicePixelRatioF()), line);
}

} // namespace velmora

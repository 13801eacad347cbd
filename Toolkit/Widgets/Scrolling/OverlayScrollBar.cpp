// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Scrolling/OverlayScrollBar.h"

#include "Toolkit/Widgets/Contrast.h"

#include <QAbstractScrollArea>
#include <QInputDevice>
#include <QPainter>
#include <QPointerEvent>
#include <QPointingDevice>
#include <QScrollBar>

#include <algorithm>

namespace velmora {

namespace {

constexpr int thickness = 4;
constexpr int distance = 2; // to the edge
constexpr int leastLength = 24;

bool isMouse(const QInputDevice& device) {
    return device.type() == QInputDevice::DeviceType::Mouse ||
           device.type() == QInputDevice::DeviceType::TouchPad;
}

bool hasOnlyFingers() {
    const QList<const QInputDevice*> devices = QInputDevice::devices();
    const auto has = [&devices](auto matches) {
        return std::any_of(devices.begin(), devices.end(),
                           [&matches](const QInputDevice* device) { return matches(*device); });
    };
    return !has(isMouse) && has([](const QInputDevice& device) {
        return device.type() == QInputDevice::DeviceType::TouchScreen;
    });
}

} // namespace

OverlayScrollBar::OverlayScrollBar(QAbstractScrollArea& area) : QWidget(&area), _area(area) {
    setObjectName("velmora.overlayScrollBar");
    setAttribute(Qt::WA_TransparentForMouseEvents);
    hide();
    area.viewport()->installEventFilter(this);
    connect(area.verticalScrollBar(), &QScrollBar::valueChanged, this, [this] { update(); });
    connect(area.verticalScrollBar(), &QScrollBar::rangeChanged, this, [this] { update(); });
    setActive(hasOnlyFingers());
}

QRect OverlayScrollBar::handle() const {
    const QScrollBar& bar = *_area.verticalScrollBar();
    if (bar.maximum() <= 0)
        return {};
    const int room = height() - 2 * distance;
    const double whole = bar.maximum() + bar.pageStep();
    const int length = std::clamp(static_cast<int>(room * (bar.pageStep() / whole)),
                                  std::min(leastLength, room), std::max(room, 0));
    const int top = static_cast<int>((room - length) * (bar.value() / static_cast<double>(bar.maximum())));
    return {0, distance + top, thickness, length};
}

void OverlayScrollBar::setActive(bool isActive) {
    _isActive = isActive;
    _area.setVerticalScrollBarPolicy(isActive ? Qt::ScrollBarAlwaysOff : Qt::ScrollBarAsNeeded);
    setVisible(isActive);
    follow();
}

void OverlayScrollBar::follow() {
    const QRect inside = _area.viewport()->geometry();
    const int left = isRightToLeft() ? inside.left() + distance : inside.right() + 1 - distance - thickness;
    setGeometry(left, inside.top(), thickness, inside.height());
    raise();
}

bool OverlayScrollBar::eventFilter(QObject* /*watched*/, QEvent* event) {
    switch (event->type()) {
    case QEvent::TouchBegin:
        if (!_isActive)
            setActive(true);
        break;
    case QEvent::Wheel:
    case QEvent::MouseButtonPress:
        // Touches that nothing takes come once more, as if they were a mouse's.
        if (_isActive && isMouse(*static_cast<QPointerEvent*>(event)->pointingDevice()))
            setActive(false);
        break;
    case QEvent::Resize:
    case QEvent::Move:
    case QEvent::LayoutDirectionChange: follow(); break;
    default: break;
    }
    return false;
}

void OverlayScrollBar::paintEvent(QPaintEvent* /*event*/) {
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    QColor ink = palette().color(QPalette::Text);
    ink.setAlphaF(0.55F);
    painter.setPen(Qt::NoPen);
    painter.setBrush(markColor(ink, palette().color(QPalette::Base), palette().color(QPalette::Text)));
    painter.drawRoundedRect(handle(), thickness / 2.0, thickness / 2.0);
}

} // namespace velmora

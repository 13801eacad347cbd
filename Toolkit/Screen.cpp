// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Screen.h"

#include "Toolkit/Widgets/Conversions.h"
#include "Toolkit/Widgets/WindowWidget.h"

#include <QGuiApplication>
#include <QScreen>

#include <algorithm>

namespace velmora {

namespace {

constexpr QSize usual(390, 844);

} // namespace

Rect Screen::mainBounds() {
    const QScreen* const screen = QGuiApplication::primaryScreen();
    if (!screen)
        return fromQt(QRect({0, 0}, usual));
    const QString platform = QGuiApplication::platformName();
    const bool isDevice = platform.startsWith("eglfs") || platform.startsWith("linuxfb");
    return fromQt(QRect({0, 0}, isDevice ? screen->size() : usual.boundedTo(screen->availableSize())));
}

Rect Screen::mainApplicationFrame() {
    const WindowWidget* const window = WindowWidget::main();
    return window ? fromQt(window->rect()) : mainBounds();
}

} // namespace velmora

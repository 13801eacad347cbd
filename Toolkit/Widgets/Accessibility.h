// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QAccessible>

#include <functional>

class QWidget;

namespace velmora {

/// Registers the accessible interfaces of windows, tables, rows, headings, notices, sheets, toolbars and busy
/// indicators. Called once, by the application.
void installAccessibility();

/// Announces an event of the widget to screen readers.
void announce(QWidget& widget, QAccessible::Event what);
/// Whether a screen reader or a test listens.
[[nodiscard]] bool hasAnnouncementListener();

using AnnouncementListener = std::function<void(QWidget& widget, QAccessible::Event what)>;
/// Sets a test's listener; null removes it.
void setAnnouncementListener(AnnouncementListener listener);

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QAccessible>

#include <functional>

class QWidget;

namespace velmora {

/// Makes tables, rows, headings, sheets and busy indicators known to screen readers as what they are. Once,
/// by the application.
void installAccessibility();

/// Tells screen readers that something happened to the widget.
void announce(QWidget& widget, QAccessible::Event what);
/// Whether anybody hears what is announced.
[[nodiscard]] bool announcementsAreHeard();

using AnnouncementListener = std::function<void(QWidget& widget, QAccessible::Event what)>;
/// Has a test hear announcements too; null ends it.
void setAnnouncementListener(AnnouncementListener listener);

} // namespace velmora

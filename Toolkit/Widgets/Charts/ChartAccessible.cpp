// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Charts/ChartAccessible.h"

#include "Toolkit/Widgets/Charts/ChartWidget.h"
#include "Toolkit/Widgets/Conversions.h"

namespace velmora {

ChartAccessible::ChartAccessible(ChartWidget& chart)
    : QAccessibleWidget(&chart, QAccessible::Chart), _chart(chart) {}

QString ChartAccessible::text(QAccessible::Text which) const {
    const auto& cursor_ns = _chart.model.cursor_ns;
    switch (which) {
    case QAccessible::Name: {
        const QString name =
            _chart.accessibleName().isEmpty() ? QStringLiteral("Chart") : _chart.accessibleName();
        return cursor_ns ? name + QStringLiteral(", ") + toQt(_chart.model.spokenReadings(*cursor_ns)) : name;
    }
    case QAccessible::Description: return toQt(_chart.model.summary());
    case QAccessible::Value: return toQt(_chart.model.spokenReadings(_chart.model.readingTime_ns()));
    case QAccessible::Help:
        return QStringLiteral(
            "Left and Right move the cursor, plus and minus zoom, N returns to now, T shows "
            "the values as a table");
    default: return QAccessibleWidget::text(which);
    }
}

QStringList ChartAccessible::actionNames() const {
    return QAccessibleWidget::actionNames() << increaseAction() << decreaseAction() << toggleAction();
}

QString ChartAccessible::localizedActionDescription(const QString& name) const {
    if (name == increaseAction())
        return QStringLiteral("Moves the cursor to the next sample");
    if (name == decreaseAction())
        return QStringLiteral("Moves the cursor to the previous sample");
    if (name == toggleAction())
        return QStringLiteral("Shows the values as a table, or the chart");
    return QAccessibleWidget::localizedActionDescription(name);
}

void ChartAccessible::doAction(const QString& name) {
    if (name == increaseAction())
        _chart.stepCursor(1);
    else if (name == decreaseAction())
        _chart.stepCursor(-1);
    else if (name == toggleAction())
        _chart.setShowsTable(!_chart.showsTable());
    else
        QAccessibleWidget::doAction(name);
}

} // namespace velmora

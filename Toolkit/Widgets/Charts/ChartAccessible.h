// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QAccessibleWidget>

namespace velmora {

class ChartWidget;

/// A chart for screen readers: its name says what the cursor is on, its description the whole; actions move
/// the cursor and show the table, which is its child then.
class ChartAccessible : public QAccessibleWidget {
public:
    explicit ChartAccessible(ChartWidget& chart);

    [[nodiscard]] QString text(QAccessible::Text which) const override;
    [[nodiscard]] QStringList actionNames() const override;
    [[nodiscard]] QString localizedActionDescription(const QString& name) const override;
    void doAction(const QString& name) override;

private:
    ChartWidget& _chart;
};

} // namespace velmora

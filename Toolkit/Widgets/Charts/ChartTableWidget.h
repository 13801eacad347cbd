// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Charts/ChartTable.h"

#include <QTableWidget>

#include <functional>
#include <optional>

namespace velmora {

/// The table that a chart shows in place of its panels. Enter takes the row's time back to the chart, T and
/// Escape only return there.
class ChartTableWidget : public QTableWidget {
public:
    explicit ChartTableWidget(QWidget* parent);

    std::function<void()> onClose;
    std::function<void(std::int64_t time_ns)> onChoose;

    /// The current row stays that of the same time once the user has chosen one; else it is that of
    /// `current_ns`.
    void fill(const ChartTable& table, std::int64_t current_ns);
    void forgetChoice() { _chosen_ns.reset(); }

protected:
    void keyPressEvent(QKeyEvent* event) override;

private:
    std::vector<std::int64_t> _times_ns; ///< of the rows
    std::optional<std::int64_t> _chosen_ns;
};

} // namespace velmora

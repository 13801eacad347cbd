// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Charts/ChartPanel.h"

#include <QLineF>

#include <vector>

namespace velmora {

/// The dashes of a kind of line, which go on from one piece of it to the next.
class DashPattern {
public:
    explicit DashPattern(ChartLine line);

    [[nodiscard]] bool isSolid() const { return _lengths.empty(); }
    /// Lengths of dashes and spaces in points, beginning with a dash.
    [[nodiscard]] const std::vector<double>& lengths() const { return _lengths; }
    /// Whether so far along the line (in points, from 0) there is a dash.
    [[nodiscard]] bool isDashAt(double along) const;
    /// Replaces lines by their dashes. A line that begins where the one before ends continues its pattern.
    void cut(std::vector<QLineF>& lines) const;

private:
    std::vector<double> _lengths;
    double _period = 0;
};

} // namespace velmora

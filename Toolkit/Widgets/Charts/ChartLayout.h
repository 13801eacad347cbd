// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Charts/ChartModel.h"
#include "Toolkit/Charts/ValueAxis.h"
#include "Toolkit/Widgets/Charts/DigitText.h"

#include <QRectF>
#include <QSizeF>

#include <vector>

namespace velmora {

/// Where everything is in a chart of some size, and the axes of values that fit there. Lengths derive from
/// the font, so that large text has room.
class ChartLayout {
public:
    struct Panel {
        QRectF title;
        std::vector<QRectF> entries; ///< of the legend, one a series
        QRectF plot;
        ValueAxis axis;
    };

    ChartLayout(const ChartModel& model, const QSizeF& size, const QFont& font, bool isRightToLeft);

    [[nodiscard]] const std::vector<Panel>& panels() const { return _panels; }
    /// The plots' edges.
    [[nodiscard]] double left() const { return _left; }
    [[nodiscard]] double width() const { return _width; }
    [[nodiscard]] QRectF lane(std::size_t number) const;
    [[nodiscard]] const QRectF& eventMarks() const { return _eventMarks; }
    [[nodiscard]] const QRectF& timeAxis() const { return _timeAxis; }
    [[nodiscard]] const DigitText& digits() const { return _digits; }
    [[nodiscard]] bool isRightToLeft() const { return _isRightToLeft; }

    /// The height in which every plot is readable.
    [[nodiscard]] double preferredHeight() const { return _preferredHeight; }

    static constexpr double swatch = 24; ///< the piece of line before a legend entry's name
    static constexpr double space = 8;

private:
    /// Gives title and legend their places from `top` on; returns where they end.
    double placeHeader(const ChartModel& model, const ChartPanel& panel, double top, double width,
                       Panel& place);

    DigitText _digits;
    bool _isRightToLeft;
    std::vector<Panel> _panels;
    double _lineHeight;
    double _left = 0;
    double _width = 0;
    std::size_t _laneCount = 0;
    QRectF _eventMarks;
    QRectF _timeAxis;
    double _preferredHeight = 0;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Charts/ChartModel.h"
#include "Toolkit/Widgets/Charts/ChartInput.h"
#include "Toolkit/Widgets/Charts/ChartScale.h"

#include <QWidget>

#include <functional>

namespace velmora {

class ChartTableWidget;

/// Draws a chart's model and lets the user move its range and cursor.
class ChartWidget : public QWidget {
public:
    ChartWidget();
    ~ChartWidget() override;

    ChartModel model;
    std::function<void(std::optional<std::int64_t>)> onCursorMoved;
    std::function<void()> onRangeChanged;

    /// After a change of panels, bands or events.
    void contentsChanged();
    void setNow(std::int64_t now_ns);
    void samplesChanged();
    /// Changes the window by the function, and says so where the range is another.
    void changeWindow(const std::function<void(TimeWindow&)>& change);
    void setCursor(std::optional<std::int64_t> time_ns);
    /// As the user does: with the callback, and announced.
    void moveCursor(std::optional<std::int64_t> time_ns);
    /// By so many samples, from the end of the range if there is no cursor.
    void stepCursor(int samples);
    void setShowsTable(bool shows);
    [[nodiscard]] bool showsTable() const;

    [[nodiscard]] ChartScale scale() const;
    [[nodiscard]] double preferredHeight() const;
    /// How often the chart was drawn.
    [[nodiscard]] std::size_t paintCount() const { return _paintCount; }
    /// Null until it was shown for the first time.
    [[nodiscard]] ChartTableWidget* table() const { return _table; }

protected:
    bool event(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void changeEvent(QEvent* event) override;
    void focusInEvent(QFocusEvent* event) override;
    void focusOutEvent(QFocusEvent* event) override;

private:
    /// Draws again, or fills the table again.
    void showChanges();
    void fillTable();
    void noteShown();

    ChartInput _input{*this};
    [[nodiscard]] std::vector<std::optional<Sample>> readingSamples() const;

    // As of the last drawing, or of the table's last filling.
    ChartScale _shown;
    std::vector<std::optional<Sample>> _shownSamples;

    ChartTableWidget* _table = nullptr;
    std::size_t _paintCount = 0;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Tables/TableCell.h"

#include <QWidget>

#include <cstddef>
#include <optional>

namespace velmora {

/// Draws a table cell's ground, separator, focus frame and accessory.
class CellWidget : public QWidget {
public:
    CellWidget();

    /// Null after the cell's destruction.
    TableCell* cell = nullptr;
    /// The cell's row, counted through all sections; absent while it is queued for reuse.
    std::optional<std::size_t> row;
    /// Its previous row.
    std::optional<std::size_t> lastRow;

    void setSelected(bool isSelected);
    void setPressed(bool isPressed);
    void setFocusFrame(bool hasFocusFrame);
    [[nodiscard]] bool isSelected() const { return _isSelected; }
    [[nodiscard]] bool isHighlighted() const { return _isSelected || _isPressed; }
    [[nodiscard]] bool hasFocusFrame() const { return _hasFocusFrame; }
    /// Announces the row's name to screen readers if it has changed since the last call.
    void announceName();

    /// How much an accessory takes of the cell's width.
    [[nodiscard]] static double accessoryWidth(TableCellAccessory accessory);
    /// Whether the widget lies in a highlighted cell.
    [[nodiscard]] static bool isOnHighlight(const QWidget& widget);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    void set(bool& flag, bool value);
    void paintAccessory(QPainter& painter) const;

    bool _isSelected = false;
    bool _isPressed = false;
    bool _hasFocusFrame = false;
    std::string _announcedName;
};

} // namespace velmora

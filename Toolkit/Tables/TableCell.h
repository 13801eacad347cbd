// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Label.h"
#include "Toolkit/Tables/TableCellAccessory.h"
#include "Toolkit/View.h"

#include <memory>
#include <string>

namespace velmora {

class CellWidget;

enum class TableCellStyle {
    plain = 0, ///< one text, where lines begin
    value = 1  ///< a leading and a trailing text
};

/// One row of a table on the screen. The data source makes cells and the table keeps them for reuse when
/// their row leaves the screen. A row's content goes into the content view, which is the cell without the
/// accessory at its trailing edge.
///
/// A row's name for screen readers is its accessible name or, without one, the texts of the labels in its
/// content view, in the order in which they were added, with ", " between ("RSSI, -80 dBm").
class TableCell : public View {
public:
    TableCell(TableCellStyle style, std::string reuseIdentifier);
    ~TableCell() override;

    [[nodiscard]] TableCellStyle style() const { return _style; }
    [[nodiscard]] const std::string& reuseIdentifier() const { return _reuseIdentifier; }
    [[nodiscard]] View& contentView() { return _contentView; }

    /// The base's own texts: on the left, and - in the value style - on the right. In the content view once
    /// used.
    [[nodiscard]] Label& textLabel();
    [[nodiscard]] Label& detailTextLabel();

    [[nodiscard]] TableCellAccessory accessory() const { return _accessory; }
    void setAccessory(TableCellAccessory accessory);

    /// The base layout: gives the content view its frame and places the base's own texts. A reused cell has
    /// its row's size already; a fresh one is 320 x 44 until the table takes it. Called again whenever the
    /// size or the accessory has changed, so an override that lays out from the content view's bounds is
    /// right at any width.
    void layoutSubviews() override;
    /// Called before a cell is reused. The base does nothing: the table deselects a cell, and resets its
    /// horizontal scrolling, when it is reused for another row.
    virtual void prepareForReuse();

    [[nodiscard]] bool isSelected() const;
    /// The accessible name, or that made of the labels.
    [[nodiscard]] std::string rowName() const;

private:
    TableCell(TableCellStyle style, std::string reuseIdentifier, CellWidget* widget);

    CellWidget* _cell;
    TableCellStyle _style;
    std::string _reuseIdentifier;
    TableCellAccessory _accessory = TableCellAccessory::none;
    View _contentView;
    std::unique_ptr<Label> _textLabel;
    std::unique_ptr<Label> _detailTextLabel;
};

} // namespace velmora

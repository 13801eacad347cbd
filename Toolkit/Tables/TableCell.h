// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Label.h"
#include "Toolkit/View.h"

#include <memory>
#include <string>

namespace velmora {

class CellWidget;

enum class TableCellStyle {
    plain = 0, ///< one text, on the left
    value = 1  ///< a left and a right text
};

enum class TableCellAccessory { none, disclosureIndicator, checkMark };

/// One row of a table on the screen. The data source makes cells and the table keeps them, to be used for
/// other rows when theirs leaves the screen. What a row shows goes into the content view, which takes the
/// cell less the accessory at its right edge.
///
/// A screen reader calls a row by its accessible name or, without one, by the texts of the labels in its
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

    /// The base layout: gives the content view its frame and places the base's own texts. A cell that is
    /// given out again has its row's size already; a fresh one is 320 x 44 until the table takes it. Called
    /// again whenever the size or the accessory has changed, so an override that lays out from the content
    /// view's bounds is right at any width.
    void layoutSubviews() override;
    /// Called before a used cell is given out again. The base does nothing: the table unselects a cell, and
    /// moves what scrolls sideways in it back to its start, when it comes to stand for another row than
    /// before.
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

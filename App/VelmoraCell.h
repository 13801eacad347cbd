// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Label.h"
#include "Toolkit/Scrolling/ScrollView.h"
#include "Toolkit/Tables/TableCell.h"

#include <memory>
#include <string>

namespace velmora {

/// A row of a measurement pane. A cell is made for one of two kinds of row and keeps that kind however it is
/// recycled: for inner rows it has a name alone, for leaf rows a name and a value in a view that scrolls
/// sideways when they do not fit. Owns its labels and that view. Main thread only.
class VelmoraCell final : public TableCell {
public:
    /// Takes a style as a cell for inner rows does.
    struct StyleKey {
        TableCellStyle style;
    };

    /// A cell for inner rows: only the name, straight in the content view.
    VelmoraCell(StyleKey styleKey, std::string reuseIdentifier);
    /// A cell for leaf rows: name and value in the scrolling view.
    VelmoraCell(TableCellStyle style, std::string reuseIdentifier);
    ~VelmoraCell() override;

    /// The row's name.
    [[nodiscard]] Label& key() { return *_key; }
    /// The leaf's value; null in a cell made for inner rows.
    [[nodiscard]] Label* value() { return _value.get(); }
    /// The view of both; null in a cell made for inner rows.
    [[nodiscard]] ScrollView* view() { return _view.get(); }

    /// Lays the cell out for an inner row, now and whenever its size changes.
    void setLayoutKey();
    /// Lays the cell out for a leaf row, now and whenever its size changes.
    void setLayout();

    void layoutSubviews() override;

private:
    void layOutKey();
    void layOut();

    std::unique_ptr<Label> _key;
    std::unique_ptr<Label> _value;
    std::unique_ptr<ScrollView> _view;
    /// Which of the two layouts was asked for last; none at first.
    void (VelmoraCell::*_layout)() = nullptr;
};

} // namespace velmora

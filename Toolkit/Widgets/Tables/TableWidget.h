// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Widgets/Tables/ShownCells.h"
#include "Toolkit/Widgets/Tables/TableInput.h"
#include "Toolkit/Widgets/Tables/TableRows.h"

#include <QAbstractScrollArea>

#include <cstddef>
#include <optional>

namespace velmora {

class EmptyLabel;
class TableView;
class TableViewDataSource;
class TableViewDelegate;

/// Lays out the rows on the screen as the user scrolls, and has the table's focus, selection and pressed row.
/// Rows are counted through all sections.
class TableWidget : public QAbstractScrollArea {
public:
    TableWidget();
    ~TableWidget() override;

    /// Null after the table view's destruction.
    TableView* view = nullptr;
    TableViewDataSource* dataSource = nullptr;
    TableViewDelegate* delegate = nullptr;

    void reload();
    /// Loads the rows if they are not loaded yet.
    void loadIfNeeded();

    [[nodiscard]] const TableRows& rows() const { return _rows; }
    [[nodiscard]] ShownCells& cells() { return _cells; }
    [[nodiscard]] const ShownCells& cells() const { return _cells; }
    [[nodiscard]] EmptyLabel& emptyLabel() const { return *_emptyLabel; }
    /// Shows or hides it.
    void showEmptyLabel();
    [[nodiscard]] int rowHeight() const;
    /// In the viewport.
    [[nodiscard]] QRect rowRect(std::size_t row) const;
    [[nodiscard]] std::optional<std::size_t> rowAt(const QPoint& place) const;
    /// How many complete rows the viewport has room for, at least 1.
    [[nodiscard]] std::size_t rowsPerPage() const;

    [[nodiscard]] std::optional<std::size_t> selectedRow() const { return _selected; }
    [[nodiscard]] std::optional<std::size_t> focusRow() const { return _focus; }
    void setSelectedRow(std::optional<std::size_t> row);
    void setPressedRow(std::optional<std::size_t> row);
    /// Scrolls to it and notifies a screen reader.
    void setFocusRow(std::optional<std::size_t> row);
    /// The focus frame is shown after keyboard use and hidden by the next click.
    void setShowsFocus(bool shows);
    void scrollToRow(std::size_t row);
    /// Opens the row's menu, if it has one, at that place of the viewport.
    void openMenu(std::size_t row, const QPoint& place);
    /// Selects the row and notifies the delegate, which may destroy the table.
    void activateRow(std::size_t row);

protected:
    void resizeEvent(QResizeEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void scrollContentsBy(int dx, int dy) override;
    bool viewportEvent(QEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void contextMenuEvent(QContextMenuEvent* event) override;
    void focusInEvent(QFocusEvent* event) override;
    void focusOutEvent(QFocusEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    void layoutRows();
    void updateScrollRange();
    void updateMarks();
    void announceFocus();

    EmptyLabel* _emptyLabel;
    TableRows _rows;
    ShownCells _cells;
    TableInput _input;
    std::optional<std::size_t> _selected;
    std::optional<std::size_t> _focus;
    std::optional<std::size_t> _pressed;
    bool _showsFocus = false;
    bool _isLayingOut = false;
    bool _isLoaded = false;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Widgets/Tables/ReuseQueue.h"
#include "Toolkit/Widgets/Tables/TableInput.h"
#include "Toolkit/Widgets/Tables/TableRows.h"

#include <QAbstractScrollArea>

#include <cstddef>
#include <map>
#include <memory>
#include <optional>

namespace velmora {

class CellWidget;
class TableCell;
class TableView;
class TableViewDataSource;
class TableViewDelegate;

/// Keeps cells for the rows on the screen, moves them as the user scrolls, and has the table's focus,
/// selection and pressed row. Rows are counted through all sections.
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
    [[nodiscard]] std::shared_ptr<TableCell> dequeue(std::string_view identifier);
    void releaseCells();

    [[nodiscard]] const TableRows& rows() const { return _rows; }
    [[nodiscard]] const std::map<std::size_t, std::shared_ptr<TableCell>>& cells() const { return _cells; }
    [[nodiscard]] CellWidget* cellWidget(std::optional<std::size_t> row) const;
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
    /// Selects the row and notifies the delegate, which may destroy the table.
    /// Opens the row's menu, if it has one, at that place of the viewport.
    void openMenu(std::size_t row, const QPoint& place);
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
    void recycle(std::size_t row);
    [[nodiscard]] std::shared_ptr<TableCell> makeCell(std::size_t row);
    void updateScrollRange();
    void updateMarks();
    void announceFocus();

    TableRows _rows;
    std::map<std::size_t, std::shared_ptr<TableCell>> _cells;
    ReuseQueue _queue;
    TableInput _input;
    std::optional<std::size_t> _selected;
    std::optional<std::size_t> _focus;
    std::optional<std::size_t> _pressed;
    bool _showsFocus = false;
    bool _isLayingOut = false;
    bool _isLoaded = false;
};

} // namespace velmora

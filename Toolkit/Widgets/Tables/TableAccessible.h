// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QAccessibleWidget>

#include <cstddef>
#include <map>

namespace velmora {

class TableWidget;

/// A list of all rows, whether or not they are on the screen, or of the text of an empty one.
class TableAccessible final : public QAccessibleWidget {
public:
    explicit TableAccessible(TableWidget& table);
    ~TableAccessible() override;
    TableAccessible(const TableAccessible&) = delete;
    TableAccessible& operator=(const TableAccessible&) = delete;

    [[nodiscard]] int childCount() const override;
    [[nodiscard]] QAccessibleInterface* child(int index) const override;
    [[nodiscard]] int indexOfChild(const QAccessibleInterface* child) const override;
    [[nodiscard]] QAccessibleInterface* childAt(int x, int y) const override;
    [[nodiscard]] QAccessibleInterface* focusChild() const override;

private:
    TableWidget& _table;
    /// Of rows that were asked for while they were not on the screen.
    mutable std::map<std::size_t, QAccessible::Id> _unseen;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Widgets/Tables/GridContent.h"

#include <QTableView>

#include <functional>
#include <string_view>

namespace velmora {

/// Draws a grid and gets its keys and clicks.
class GridWidget : public QTableView {
public:
    GridWidget();

    std::function<void(std::size_t row)> onChoose;

    [[nodiscard]] GridContent& content() { return _content; }
    void setPlaceholder(std::string_view text);
    void layoutColumns();
    void layoutRows();
    [[nodiscard]] int rowHeight() const;
    [[nodiscard]] int headHeight() const;

protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    void choose(const QModelIndex& index);
    void moveTo(int row);

    GridContent _content;
    QString _placeholder;
};

} // namespace velmora

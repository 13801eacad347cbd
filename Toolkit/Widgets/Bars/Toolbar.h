// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Bars/ToolbarItem.h"

#include <QWidget>

#include <memory>
#include <vector>

class QHBoxLayout;

namespace velmora {

/// The bar at the bottom of a navigation stack. Items reuse the widgets of earlier items of their kind, so
/// that a button keeps the focus and an unfinished click.
class Toolbar : public QWidget {
public:
    Toolbar();
    ~Toolbar() override;

    void setItems(const std::vector<std::shared_ptr<ToolbarItem>>& items);
    /// Presses the Save button, if there is one.
    void save();

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    enum class Kind { busyIndicator, label, flexibleSpace, saveButton };
    struct Place {
        Kind kind;
        std::shared_ptr<ToolbarItem> item;
        QWidget* widget;
    };

    [[nodiscard]] static Kind kindOf(const ToolbarItem& item);
    [[nodiscard]] QWidget* makeWidget(Kind kind);
    [[nodiscard]] QWidget* takeWidget(std::vector<Place>& places, Kind kind);
    static void fill(const Place& place);

    std::vector<Place> _places;
    QHBoxLayout* _layout;
};

} // namespace velmora

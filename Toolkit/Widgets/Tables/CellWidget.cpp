// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Tables/CellWidget.h"

#include "Toolkit/Widgets/Accessibility.h"
#include "Toolkit/Widgets/Contrast.h"

#include <QPainter>
#include <QPainterPath>
#include <QStyle>
#include <QStyleOptionFocusRect>

#include <utility>

namespace velmora {

CellWidget::CellWidget() {
    setObjectName("velmora.row");
}

void CellWidget::setSelected(bool isSelected) {
    set(_isSelected, isSelected);
}

void CellWidget::setPressed(bool isPressed) {
    set(_isPressed, isPressed);
}

void CellWidget::setFocusFrame(bool hasFocusFrame) {
    set(_hasFocusFrame, hasFocusFrame);
}

void CellWidget::set(bool& flag, bool value) {
    if (std::exchange(flag, value) == value)
        return;
    update(); // with the labels on it, whose colour depends on it
}

void CellWidget::announceName() {
    if (!hasAnnouncementListener() || !cell)
        return;
    std::string name = cell->rowName();
    if (name == _announcedName)
        return;
    _announcedName = std::move(name);
    announce(*this, QAccessible::NameChanged);
}

double CellWidget::accessoryWidth(TableCellAccessory accessory) {
    switch (accessory) {
    case TableCellAccessory::none: break;
    case TableCellAccessory::disclosureIndicator: return 30;
    case TableCellAccessory::checkMark: return 40;
    }
    return 0;
}

bool CellWidget::isOnHighlight(const QWidget& widget) {
    for (const QWidget* outer = widget.parentWidget(); outer; outer = outer->parentWidget())
        if (const auto* const cellWidget = dynamic_cast<const CellWidget*>(outer))
            return cellWidget->isHighlighted();
    return false;
}

void CellWidget::paintEvent(QPaintEvent* /*event*/) {
    QPainter painter(this);
    if (isHighlighted())
        painter.fillRect(rect(), palette().highlight());
    // One pixel of the display, whatever its scale.
    const double hair = 1 / devicePixelRatioF();
    QColor line = palette().color(QPalette::Text);
    line.setAlphaF(0.18F);
    painter.fillRect(QRectF(isRightToLeft() ? 0 : 10, height() - hair, width() - 10, hair), line);
    paintAccessory(painter);
    if (_hasFocusFrame) {
        QStyleOptionFocusRect option;
        option.initFrom(this);
        option.rect = rect().adjusted(1, 1, -1, -1);
        option.backgroundColor = palette().color(isHighlighted() ? QPalette::Highlight : QPalette::Base);
        option.state |= QStyle::State_KeyboardFocusChange | QStyle::State_HasFocus;
        style()->drawPrimitive(QStyle::PE_FrameFocusRect, &option, &painter, this);
    }
}

void CellWidget::paintAccessory(QPainter& painter) const {
    if (!cell || cell->accessory() == TableCellAccessory::none)
        return;
    const double middle = height() / 2.0;
    const bool isMirrored = isRightToLeft();
    const double left = isMirrored ? accessoryWidth(cell->accessory()) - 27
                                   : width() - accessoryWidth(cell->accessory()) + 10;
    QPainterPath path;
    QPalette::ColorRole role = QPalette::PlaceholderText;
    if (cell->accessory() == TableCellAccessory::disclosureIndicator) {
        // It points to where the list comes in from; a check mark is the same everywhere.
        const double tip = isMirrored ? left + 10 : left + 7;
        const double back = isMirrored ? tip + 6 : tip - 6;
        path.moveTo(back, middle - 6);
        path.lineTo(tip, middle);
        path.lineTo(back, middle + 6);
    } else {
        path.moveTo(left + 1, middle);
        path.lineTo(left + 6, middle + 5);
        path.lineTo(left + 16, middle - 7);
        role = QPalette::Highlight;
    }
    const QColor color = isHighlighted() ? palette().color(QPalette::HighlightedText)
                                         : markColor(palette().color(role), palette().color(QPalette::Base),
                                                     palette().color(QPalette::Text));
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(QPen(color, 2, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    painter.drawPath(path);
    painter.setRenderHint(QPainter::Antialiasing, false);
}

} // namespace velmora

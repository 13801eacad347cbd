// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Tables/TableCell.h"

#include "Toolkit/Widgets/Tables/CellWidget.h"

#include <algorithm>
#include <utility>

namespace velmora {

namespace {

constexpr double margin = 10;

std::unique_ptr<Label> makeLabel(View& contentView, TextAlignment alignment) {
    auto label = std::make_unique<Label>();
    label->setTextAlignment(alignment);
    contentView.addSubview(*label);
    return label;
}

void appendTexts(const View& view, std::string& texts) {
    for (const View* subview : view.subviews()) {
        if (subview->isHidden())
            continue;
        if (const auto* const label = dynamic_cast<const Label*>(subview)) {
            const std::string text =
                label->accessibleName().empty() ? label->text() : label->accessibleName();
            if (!text.empty() && !texts.empty())
                texts += ", ";
            texts += text;
        }
        appendTexts(*subview, texts);
    }
}

} // namespace

TableCell::TableCell(TableCellStyle style, std::string reuseIdentifier)
    : TableCell(style, std::move(reuseIdentifier), new CellWidget) {}

TableCell::TableCell(TableCellStyle style, std::string reuseIdentifier, CellWidget* widget)
    : View(widget), _cell(widget), _style(style), _reuseIdentifier(std::move(reuseIdentifier)) {
    _cell->cell = this;
    addSubview(_contentView);
    View::setFrame({0, 0, 320, 44});
}

TableCell::~TableCell() {
    _cell->cell = nullptr;
}

Label& TableCell::textLabel() {
    if (!_textLabel)
        _textLabel = makeLabel(_contentView, TextAlignment::left);
    return *_textLabel;
}

Label& TableCell::detailTextLabel() {
    if (!_detailTextLabel)
        _detailTextLabel = makeLabel(_contentView, TextAlignment::right);
    return *_detailTextLabel;
}

void TableCell::setAccessory(TableCellAccessory accessory) {
    if (std::exchange(_accessory, accessory) == accessory)
        return;
    _cell->update();
    layoutSubviews();
}

void TableCell::layoutSubviews() {
    const double width = std::max(bounds().width - CellWidget::accessoryWidth(_accessory), 0.0);
    const double height = bounds().height;
    _contentView.setFrame({0, 0, width, height});
    const double room = std::max(width - 2 * margin, 0.0);
    // The right text has what it needs up to half of the room, or what the left one leaves.
    double detail = 0;
    if (_detailTextLabel) {
        const double wanted = sizeOfText(_detailTextLabel->text(), _detailTextLabel->font()).width;
        const double left =
            _textLabel ? sizeOfText(_textLabel->text(), _textLabel->font()).width + margin : 0;
        detail = std::min(wanted, std::max(room / 2, room - left));
        _detailTextLabel->setHidden(_style != TableCellStyle::value);
        _detailTextLabel->setFrame({margin + room - detail, 0, detail, height});
    }
    if (_textLabel)
        _textLabel->setFrame({margin, 0, std::max(detail > 0 ? room - detail - margin : room, 0.0), height});
}

void TableCell::prepareForReuse() {}

bool TableCell::isSelected() const {
    return _cell->isSelected();
}

std::string TableCell::rowName() const {
    std::string name = accessibleName();
    if (name.empty())
        appendTexts(_contentView, name);
    return name;
}

} // namespace velmora

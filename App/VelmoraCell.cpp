// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/VelmoraCell.h"

#include <utility>

namespace velmora {

namespace {

constexpr double fontSize = 15;
constexpr double leftMargin = 10;
/// Between name and value.
constexpr double gap = 50;
constexpr double scrollHeight = 50;

std::unique_ptr<Label> makeLabel(const Font& font) {
    auto label = std::make_unique<Label>();
    label->setFont(font);
    label->setTextAlignment(TextAlignment::left);
    return label;
}

/// Values are measured in the bold font too, although they are drawn in the regular one. That is meant: all
/// measures of a row are taken the same way.
Size measured(const Label& label) {
    return sizeOfText(label.text(), Font::boldSystemFontOfSize(fontSize));
}

} // namespace

VelmoraCell::VelmoraCell(StyleKey styleKey, std::string reuseIdentifier)
    : TableCell(styleKey.style, std::move(reuseIdentifier)),
      _key(makeLabel(Font::boldSystemFontOfSize(fontSize))) {
    contentView().addSubview(*_key);
}

VelmoraCell::VelmoraCell(TableCellStyle style, std::string reuseIdentifier)
    : TableCell(style, std::move(reuseIdentifier)), _key(makeLabel(Font::boldSystemFontOfSize(fontSize))),
      _value(makeLabel(Font::systemFontOfSize(fontSize))), _view(std::make_unique<ScrollView>()) {
    _view->addSubview(*_key);
    _view->addSubview(*_value);
    contentView().addSubview(*_view);
}

VelmoraCell::~VelmoraCell() = default;

void VelmoraCell::setLayoutKey() {
    _layout = &VelmoraCell::layOutKey;
    layoutSubviews();
}

void VelmoraCell::setLayout() {
    _layout = &VelmoraCell::layOut;
    layoutSubviews();
}

void VelmoraCell::layoutSubviews() {
    TableCell::layoutSubviews();
    if (_layout)
        (this->*_layout)();
}

void VelmoraCell::layOutKey() {
    const Rect content = contentView().bounds();
    const Size key = measured(*_key);
    _key->setFrame({content.x + leftMargin, (content.height - key.height) * 0.5, key.width, key.height});
}

void VelmoraCell::layOut() {
    const auto [x, y, width, height] = contentView().bounds();
    const Size key = measured(*_key);
    _key->setFrame({x + leftMargin, (height - key.height) * 0.5, key.width, key.height});
    // A cell made for inner rows has neither of the two; the name is all that it shows of a leaf.
    if (!_value || !_view)
        return;
    const Size value = measured(*_value);
    const double needed = key.width + leftMargin + gap + value.width;
    // A row that fits to the point has its value beside the name, and nothing to scroll.
    const double valueX = needed < width ? width - value.width : x + leftMargin + key.width + gap;
    _value->setFrame({valueX, (height - value.height) * 0.5, value.width, value.height});
    _view->setContentSize({needed > width ? width + key.width + value.width : width, scrollHeight});
    _view->setFrame({x, y, width, scrollHeight});
}

} // namespace velmora

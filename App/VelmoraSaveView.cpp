// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/VelmoraSaveView.h"

#include <algorithm>

namespace velmora {

namespace {

constexpr double margin = 12;
constexpr double headingSize = 17;

} // namespace

VelmoraSaveView::VelmoraSaveView(std::string_view heading, TableView& list, TextField& description)
    : _list(list), _description(description), _heading(heading), _cancel("Cancel", ButtonRole::cancel),
      _save("Save", ButtonRole::save) {
    setBackgroundColor(Color::ground);
    _heading.setFont(Font::boldSystemFontOfSize(headingSize));
    _heading.setTextAlignment(TextAlignment::center);
    _heading.setHeading(true);
    _description.setPlaceholder("Description");
    _list.setAccessibleName("What is saved");
    _list.setEmptyText("Nothing has been reported.");
    for (View* part :
         {static_cast<View*>(&_cancel), static_cast<View*>(&_heading), static_cast<View*>(&_save),
          static_cast<View*>(&_description), static_cast<View*>(&_list)})
        addSubview(*part);
}

void VelmoraSaveView::layoutSubviews() {
    const auto [x, y, width, height] = bounds();
    _cancel.sizeToFit();
    _save.sizeToFit();
    _description.sizeToFit();
    const Size cancel = _cancel.bounds().size();
    const Size save = _save.bounds().size();
    const double rowHeight = std::max(cancel.height, save.height);
    const double side = std::max(cancel.width, save.width) + 2 * margin;
    const Size heading = sizeOfText(_heading.text(), _heading.font());
    const bool isBeside = heading.width <= width - 2 * side;
    _cancel.setFrame({x + margin, y + margin, cancel.width, rowHeight});
    _save.setFrame({x + width - margin - save.width, y + margin, save.width, rowHeight});
    double fieldTop = y + margin + rowHeight + margin;
    if (isBeside) {
        // The same margin on both sides centres it.
        _heading.setFrame({x + side, y + margin, width - 2 * side, rowHeight});
    } else {
        _heading.setFrame({x + margin, fieldTop, std::max(0.0, width - 2 * margin), heading.height});
        fieldTop += heading.height + margin;
    }

    const double fieldHeight = _description.bounds().height;
    _description.setFrame({x + margin, fieldTop, width - 2 * margin, fieldHeight});

    const double listTop = fieldTop + fieldHeight + margin;
    _list.setFrame({x, listTop, width, std::max(0.0, y + height - listTop)});
    _list.sizeToFit();
}

} // namespace velmora

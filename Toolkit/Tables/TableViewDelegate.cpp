// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Tables/TableViewDelegate.h"

namespace velmora {

void TableViewDelegate::didSelectRowAtIndexPath(TableView& /*tableView*/, const IndexPath& /*indexPath*/) {}

std::vector<MenuItem> TableViewDelegate::menuForRowAtIndexPath(TableView& /*tableView*/,
                                                               const IndexPath& /*indexPath*/) {
    return {};
}

} // namespace velmora

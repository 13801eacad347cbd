// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Drive/PinnedRow.h"

namespace velmora {

bool PinnedRow::find(const Catalogue& catalogue) {
    _leaf = nullptr;
    const PathPattern pattern(_path);
    for (const CatalogueField& each : catalogue.fields())
        if (each.kind == ObservedKind::Number)
            if (auto rows = pattern.select(each)) {
                _leaf = &each;
                _rows = std::move(*rows);
                return true;
            }
    return false;
}

} // namespace velmora

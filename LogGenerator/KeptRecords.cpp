// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/KeptRecords.h"

namespace velmora {

void KeptRecords::clear() {
    for (Kept& kept : _kept) {
        kept.order = 0;
        kept.shown = 0;
    }
    _lastOrder += 2; // no record does that: see changes()
}

std::size_t KeptRecords::earliest() const {
    std::size_t found = none;
    for (std::size_t i = 0; i < _kept.size(); ++i)
        if (_kept[i].isPending() && (found == none || _kept[i].order < _kept[found].order))
            found = i;
    return found;
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/KeptRecords.h"

namespace velmora {

bool KeptRecords::keep(std::size_t view, Bytes bytes, Parts parts) {
    Kept& kept = _kept[view];
    kept.bytes.assign(bytes.begin(), bytes.end());
    kept.parts = parts;
    kept.order = ++_lastOrder;
    return (parts & ~kept.shown) != 0;
}

void KeptRecords::dropAllBut(std::size_t view) {
    for (std::size_t i = 0; i < _kept.size(); ++i)
        if (i != view)
            _kept[i].order = 0;
}

void KeptRecords::clear() {
    for (Kept& kept : _kept) {
        kept.order = 0;
        kept.shown = 0;
    }
}

std::size_t KeptRecords::earliest() const {
    std::size_t found = none;
    for (std::size_t i = 0; i < _kept.size(); ++i)
        if (_kept[i].isPending() && (found == none || _kept[i].order < _kept[found].order))
            found = i;
    return found;
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Catalogue.h"

#include <vector>

namespace velmora {

/// What an analysis makes of each leaf of a catalogue, found by the leaf's index: it is worked out once a
/// leaf, also for those that the catalogue gets later.
template <class Value>
class LeafTable {
public:
    explicit LeafTable(const Catalogue& catalogue) : _catalogue(catalogue) {}

    /// `make` turns a leaf into the value. Valid until the next call.
    template <class Make>
    [[nodiscard]] const Value& at(const CatalogueField& leaf, Make make) {
        if (leaf.index >= _values.size()) [[unlikely]]
            fill(leaf.index, make);
        return _values[leaf.index];
    }

private:
    template <class Make>
    void fill(std::size_t index, Make make) {
        while (index >= _values.size())
            _values.push_back(make(_catalogue.fields()[_values.size()]));
    }

    const Catalogue& _catalogue;
    std::vector<Value> _values; ///< by index
};

} // namespace velmora

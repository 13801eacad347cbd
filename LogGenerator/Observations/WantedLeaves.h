// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Catalogue.h"
#include "LogGenerator/Observations/Observation.h"

#include <cstdint>
#include <vector>

namespace velmora {

/// The leaves that a sink uses. It is asked once a leaf. All are wanted where there is no sink.
class WantedLeaves {
public:
    WantedLeaves() = default;
    /// The sink must outlive it.
    explicit WantedLeaves(const ObservationSink& sink) : _sink(&sink), _hasRowKeys(sink.wantsRowKeys()) {}

    /// Whether the leaf is observed: it is wanted, or identifies the row of others and row keys are wanted.
    [[nodiscard]] bool has(const CatalogueField& leaf) const {
        if (leaf.index < _known.size() && _known[leaf.index] != Known::No)
            return _known[leaf.index] == Known::Wanted;
        return ask(leaf);
    }
    /// Whether any leaf at the node or below it is observed, also one that messages may name later. A list
    /// whose rows have no fields is observed too.
    [[nodiscard]] bool hasAnyAt(const CatalogueNode& node) const;
    [[nodiscard]] bool hasRowKeys() const { return _hasRowKeys; }

private:
    enum class Known : std::uint8_t { No, Wanted, Unwanted };

    [[nodiscard]] bool ask(const CatalogueField& leaf) const;

    const ObservationSink* _sink = nullptr;
    bool _hasRowKeys = true;
    mutable std::vector<Known> _known; ///< what the sink has answered, by index in the catalogue
};

} // namespace velmora

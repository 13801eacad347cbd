// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Picture/LeafUse.h"
#include "Analysis/Picture/Reading.h"

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>
#include <vector>

namespace velmora {

/// The neighbour cells of the latest report of each list. A list that is reported a carrier at a time is
/// replaced carrier by carrier.
class NeighbourCells {
public:
    /// Cells that were not reported for so long are left out.
    static constexpr std::chrono::seconds lifetime{10};
    /// No message has more; the weakest are left out.
    static constexpr std::size_t most = 512;

    void beginMessage() { _new.clear(), _channel.reset(), _row = {}; }
    /// An observation of a neighbour. `table` says which sets there are.
    void add(const Observation& observation, const LeafUse& use, const MessageReport& report,
             const TechnologyTable& table);
    /// The message replaced the list.
    void replaced(const CatalogueNode& list) { _replaced.push_back(&list); }
    /// All has been added. Whether anything changed.
    bool endMessage(Time now);
    /// Those of earlier messages.
    void forgetAll() { _kept.clear(), _cells.clear(); }

    /// The strongest first; those without a level last.
    [[nodiscard]] std::span<const Neighbour> cells() const { return _cells; }

private:
    struct Cell {
        Neighbour neighbour;
        const CatalogueNode* list;
        bool isServing = false; ///< and no neighbour
        std::size_t order = 0;  ///< in which it was reported
    };
    struct Row {
        const CatalogueNode* list = nullptr;
        std::uint32_t number = 0;
    };

    void removeReplaced(Time now);
    void removeRepeated();

    std::vector<Cell> _kept;
    std::vector<Cell> _new;                      ///< of this message
    std::vector<const CatalogueNode*> _replaced; ///< by this message
    std::vector<Neighbour> _cells;               ///< the kept ones, in order
    std::optional<double> _channel;              ///< of this message's cells that have none
    Row _row;                                    ///< of the latest one in `_new`
};

} // namespace velmora

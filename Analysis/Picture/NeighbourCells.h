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
    void forgetAll() { _cells.clear(), _lists.clear(), _oldest = Time::max(); }

    /// Those of a picture of another decoder, in the order of their levels, and their lists.
    void setAll(std::vector<Neighbour> cells, std::vector<const CatalogueNode*> lists);
    [[nodiscard]] const std::vector<const CatalogueNode*>& lists() const { return _lists; }

    /// The strongest first; those without a level last.
    [[nodiscard]] std::span<const Neighbour> cells() const { return _cells; }

private:
    struct NewCell {
        Neighbour neighbour;
        const CatalogueNode* list;
        bool isServing = false; ///< and no neighbour
    };
    struct Row {
        const CatalogueNode* list = nullptr;
        std::uint32_t number = 0;
    };
    /// A cell's place in the order of levels. Cells are large: their ranks are sorted instead.
    struct Rank {
        double level;        ///< that of a cell without one is below all others
        std::uint32_t order; ///< of the report: the kept cells, then the new ones

        friend bool operator<(const Rank& one, const Rank& other) {
            return one.level != other.level ? one.level > other.level : one.order < other.order;
        }
    };

    [[nodiscard]] bool isReplaced(const Neighbour& cell, const CatalogueNode* list, Time now) const;
    /// The cell of that order.
    [[nodiscard]] const Neighbour& at(std::uint32_t order) const {
        return order < _cells.size() ? _cells[order] : _new[order - _cells.size()].neighbour;
    }
    [[nodiscard]] const CatalogueNode* listOf(std::uint32_t order) const {
        return order < _lists.size() ? _lists[order] : _new[order - _lists.size()].list;
    }
    /// Whether the message may have replaced a kept cell, with or without new ones.
    [[nodiscard]] bool mayReplace() const;
    /// Ranks the cells that stay and the new ones.
    void rank(Time now);
    void rankNew();
    /// The slot of a cell of the same identity, or the free one for it. Precondition: the cell has one.
    [[nodiscard]] std::uint32_t& slotOf(const Neighbour& cell);
    /// Puts the cells in the order of their ranks.
    void arrange();

    std::vector<Neighbour> _cells;               ///< in the order of their levels
    std::vector<const CatalogueNode*> _lists;    ///< that each of them is of
    Time _oldest = Time::max();                  ///< of the cells
    std::vector<NewCell> _new;                   ///< of this message
    std::vector<const CatalogueNode*> _replaced; ///< by this message
    std::optional<double> _channel;              ///< of this message's cells that have none
    Row _row;                                    ///< of the latest one in `_new`

    // Storage that is used again:
    std::vector<Rank> _ranks;
    std::vector<Rank> _newRanks;
    std::vector<std::uint32_t> _seen; ///< a hash table of new cells by their order, plus 1
    std::vector<Neighbour> _nextCells;
    std::vector<const CatalogueNode*> _nextLists;
};

} // namespace velmora

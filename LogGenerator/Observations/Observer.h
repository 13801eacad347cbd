// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/FieldVisitor.h"
#include "LogGenerator/Observations/FieldMap.h"
#include "LogGenerator/Observations/Observation.h"
#include "LogGenerator/Observations/ObservedRows.h"
#include "LogGenerator/Observations/RowKeys.h"
#include "LogGenerator/Observations/TextArena.h"
#include "LogGenerator/Observations/WantedLeaves.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>
#include <string_view>
#include <utility>
#include <vector>

namespace velmora {

class Dictionary;

/// Gathers what the decode functions name of a message as observations. Once messages repeat, it allocates
/// nothing. What a map does not have, since the display has no place for it, is not observed.
class Observer final : public FieldVisitor {
public:
    /// Only what is wanted is observed from now on. By default all is.
    void setWanted(WantedLeaves wanted) { _wanted = std::move(wanted); }
    [[nodiscard]] const WantedLeaves& wanted() const { return _wanted; }

    /// A message begins; what was observed of the earlier one is gone.
    void beginMessage();
    /// The fields of a section follow, from a record of that code. False where the section has named that
    /// record's fields already: a code that is subscribed twice is observed once.
    [[nodiscard]] bool beginSection(const FieldMap& map, std::uint32_t code);
    /// The decoder found the message malformed. The first damage of a message counts.
    void damaged(Damage damage) {
        if (_damage == Damage::None)
            _damage = damage;
    }
    /// All of the message, as it arrived at that time, which is that of its sections' latest record.
    [[nodiscard]] ObservedMessage message(Time arrival, std::optional<std::uint32_t> code,
                                          std::optional<std::uint64_t> timestamp) const;

    /// The leaves of a property list that is shown at the node.
    void tree(Catalogue& catalogue, Catalogue::Node& node, std::string_view section, const Value& value);

    /// The same of the entire display: what an earlier one had and this one has not is removed.
    void display(Catalogue& catalogue, const Value& value);

    void fields(const Record& record, const Layout& layout) override;
    void rows(const List& list, const CountedList& entries, const Layout& layout) override;
    void number(const Field& field, std::int64_t raw) override;
    void real(const Field& field, double value) override;
    void text(const Field& field, std::string_view text) override;
    void supplied(const Field& field, const Value& value) override;
    void removed(std::string_view label) override;
    void beginWhole() override;
    void endWhole() override;
    /// Observing begins, or goes on after an interruption: any leaf may show something of earlier messages.
    void assumeAllShown() { _shown.clear(); }

    void beginList(const List& list) override;
    void beginRow() override;
    void endRow() override;
    void entryNumber(std::size_t index, std::uint16_t number) override;
    void endList() override;

private:
    struct Level {
        const List* list;
        ObservedRows::Numbers outerRow;  ///< that the list is in; empty for none
        std::uint32_t next = 0;          ///< the index of the next entry
        std::size_t firstOfRow = 0;      ///< the first observation of the row
        std::string_view numberKey = {}; ///< of the entry in a numbered list
    };

    [[nodiscard]] const List* currentList() const { return _levels.empty() ? nullptr : _levels.back().list; }
    /// Calls `observe(entry, observation)` for each leaf that shows the field.
    template <class Observe>
    void forEachLeaf(const Field& field, Observe observe);
    /// The fields of a table by what the map has found of them.
    void tableFields(std::span<const FieldMap::TableEntry> entries, const Record& record);
    /// `Entry` is one of either kind of the map.
    template <class Entry>
    void setNumber(const Entry& entry, std::int64_t raw, Observation& observation);
    Observation& add(const CatalogueField& leaf, const CatalogueSource* source) {
        Observation& observation = _observations.emplace_back();
        observation.leaf = &leaf;
        observation.source = source;
        observation.rows = _row;
        if (!_levels.empty())
            observation.rowKey = _levels.back().numberKey;
        return observation;
    }
    /// Sets what identifies the row of the observations from `first` on, by the leaves of these names.
    void setKey(std::size_t first, std::span<const std::string_view> names);
    /// The leaves at the node and below it that none of the observations from that one on is of show nothing
    /// any more.
    void removeOthers(const Catalogue::Node& node, std::size_t first);
    /// A value of a list without rows begins.
    void beginValue();
    /// Whether the leaf may show something; by default it may.
    [[nodiscard]] bool mayBeShown(const CatalogueField& leaf) const {
        return leaf.index >= _shown.size() || _shown[leaf.index];
    }
    void setShown(const CatalogueField& leaf, bool isShown);
    void leaf(const CatalogueField& leaf, const Value& value);

    std::uint64_t _messages = 0;
    Damage _damage = Damage::None; ///< of this message
    const FieldMap* _map = nullptr;
    std::uint32_t _code = 0; ///< of the record whose fields are named
    std::vector<std::pair<const FieldMap*, std::uint32_t>> _sections; ///< of this message
    std::vector<Observation> _observations;
    std::vector<ObservedList> _lists;
    std::vector<const CatalogueField*> _removed;
    std::size_t _firstOfWhole = 0; ///< the first observation of a whole account
    std::vector<bool> _named;      ///< by index in the catalogue, in the whole account
    std::vector<bool> _shown;      ///< by index in the catalogue, of sections with whole accounts
    std::vector<bool> _displayed;  ///< by index in the catalogue, see `display`
    std::vector<bool> _displayedBefore;
    std::vector<Level> _levels;
    TextArena _texts;
    RowKeys _keys;
    ObservedRows _rows;
    ObservedRows::Numbers _row; ///< the numbers of the current row; empty outside of lists
    WantedLeaves _wanted;
};

} // namespace velmora

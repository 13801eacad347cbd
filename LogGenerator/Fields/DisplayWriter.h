// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Display/WantedLabels.h"
#include "LogGenerator/Fields/FieldVisitor.h"
#include "PropertyLists/Value.h"

#include <array>
#include <cstddef>
#include <vector>

namespace velmora {

/// Writes the text of each field into a section's node of the display: fields under their labels into a
/// dictionary, the section's own list into an array. What is named for a node of the other kind is ignored.
///
/// A list is written over the one of the record before: what nothing else refers to is filled again, and rows
/// that a shorter list leaves are kept for the next longer one, so that a list that is shown after each
/// record keeps its storage. What has been handed out stays as it is.
class DisplayWriter final : public FieldVisitor {
public:
    /// The rows that shorter lists do not use, kept for later ones.
    using SpareRows = std::vector<Value>;

    /// `wanted`: the labels of the dictionary or of the list's rows that are written, others are ignored;
    /// null for all. It must outlive the writer.
    DisplayWriter(Dictionary& node, SpareRows& spare, const WantedLabels* wanted = nullptr)
        : _spare(spare), _wanted(wanted) {
        _levels[0].dictionary = &node;
    }
    DisplayWriter(Array& node, SpareRows& spare, const WantedLabels* wanted = nullptr)
        : _ownList(&node), _spare(spare), _wanted(wanted), _wantedDepth(rowsOfOwnList) {}

    void fields(const Record& record, const Layout& layout) override;
    void number(const Field& field, std::int64_t raw) override;
    void real(const Field& field, double value) override;
    void text(const Field& field, std::string_view text) override;
    void supplied(const Field& field, const Value& value) override;
    void removed(std::string_view label) override;
    void beginWhole() override;
    void endWhole() override;

    void beginList(const List& list) override;
    void beginRow() override;
    void endRow() override;
    /// Numbered lists are CDMA's, which has no sections.
    void entryNumber(std::size_t index, std::uint16_t number) override;
    void endList() override;

private:
    /// A dictionary or list that is being written; neither where it is ignored.
    struct Level {
        Dictionary* dictionary = nullptr;
        Array* list = nullptr;
        std::size_t next = 0; ///< the index of the next entry in a list or row
        bool isRow = false;   ///< its entries are written one after another, from `next` on
    };
    /// The section's node, a list, a row, a list in it, and a row there.
    static constexpr std::size_t deepest = 5;
    static constexpr std::size_t rowsOfOwnList = 2;

    [[nodiscard]] Level& level() { return _levels[_depth]; }
    void push(const Level& level);
    void put(std::string_view label, std::string_view text);
    /// Whether labels here are written as far as they are wanted, not all of them.
    [[nodiscard]] bool isChosen() const { return _wanted && _depth == _wantedDepth; }
    /// Whether what is named under the label is written nowhere.
    [[nodiscard]] bool ignores(std::string_view label) const {
        const Level& to = _levels[_depth];
        return (!to.dictionary && !to.list) || (isChosen() && !_wanted->has(label));
    }

    /// The dictionary in a list's slot, to be filled again; another where there is none or something else
    /// refers to it too.
    [[nodiscard]] Dictionary& rowIn(Value& slot);

    Array* _ownList = nullptr;
    SpareRows& _spare;
    const WantedLabels* _wanted;
    std::size_t _wantedDepth = 0; ///< of the level that has these labels
    std::array<Level, deepest> _levels;
    std::size_t _depth = 0;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

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

    DisplayWriter(Dictionary& node, SpareRows& spare) : _spare(spare) { _levels[0].dictionary = &node; }
    DisplayWriter(Array& node, SpareRows& spare) : _ownList(&node), _spare(spare) {}

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

    [[nodiscard]] Level& level() { return _levels[_depth]; }
    void push(const Level& level);
    void put(std::string_view label, std::string_view text);

    /// The dictionary in a list's slot, to be filled again; another where there is none or something else
    /// refers to it too.
    [[nodiscard]] Dictionary& rowIn(Value& slot);

    Array* _ownList = nullptr;
    SpareRows& _spare;
    std::array<Level, deepest> _levels;
    std::size_t _depth = 0;
};

} // namespace velmora

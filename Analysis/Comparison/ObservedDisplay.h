// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Observation.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace velmora {

/// A value that a display shows.
struct ShownValue {
    const CatalogueField* leaf = nullptr;
    ObservedKind kind = ObservedKind::Absent;
    double number = 0;    ///< of a number, in the leaf's unit
    std::int64_t raw = 0; ///< of an enumeration or a flag
    std::string words;    ///< of a text; of bytes, the bytes
    std::string text;     ///< as the display shows it
    /// What identifies its row from display to display: "10054/45"; empty outside of lists. Rows of one list
    /// that have the same are numbered: "33/0-0 #2".
    std::string row;
    std::vector<std::uint32_t> rows; ///< the numbers that lead to it in its display, the outermost first
    /// The index of the leaf, or of the first one in the same list: the values of a list's rows are together.
    std::size_t group = 0;

    /// Whether both mean the same: the text of a number alone makes no difference.
    [[nodiscard]] bool isSame(const ShownValue& other) const;
};

/// What the display of a technology shows, made from what its messages reported.
class ObservedDisplay {
public:
    void update(const ObservedMessage& message);

    /// In the order of the catalogue; of a list, row by row.
    [[nodiscard]] std::vector<ShownValue> values() const;

private:
    /// An observation and the storage of what it refers to.
    struct Kept {
        explicit Kept(const Observation& kept);

        Observation observation; ///< without its views
        std::vector<std::uint32_t> rows;
        std::string rowKey;
        std::string words;
        std::string given;
        std::string bytes;
    };

    [[nodiscard]] static ShownValue shown(const Kept& kept, ObservedText& texts);
    void removeAll(const CatalogueNode& list);
    void remove(const CatalogueField& leaf);
    void add(const Observation& observation);

    /// By the leaf's index in the catalogue; more than one in a list alone.
    std::vector<std::vector<Kept>> _values;
};

} // namespace velmora

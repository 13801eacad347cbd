// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Statistics/NumberFigures.h"
#include "Export/Report/LeafExtremes.h"
#include "LogGenerator/Fields/Role.h"
#include "LogGenerator/Observations/Catalogue.h"

#include <array>
#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

class DriveReport;
class Markup;
class TechnologyReport;

/// A table of the figures of numbers, with the messages that reported their extremes. Of two inputs each has
/// a row, and their difference a third.
class FigureRows {
public:
    struct Row {
        std::string name;
        Unit unit = Unit::None;
        std::array<std::optional<NumberFigures>, 2> figures; ///< by input
        std::array<LeafExtremes::Extremes, 2> extremes;
        std::array<MessageRange, 2> messages; ///< of all samples

        /// Considers the leaf's extremes and messages.
        void add(const TechnologyReport& technology, const CatalogueField& leaf);
    };

    /// Begins the table; it ends with this object.
    FigureRows(Markup& out, const DriveReport& report, std::string_view caption);
    ~FigureRows();
    FigureRows(const FigureRows&) = delete;
    FigureRows& operator=(const FigureRows&) = delete;

    /// Writes nothing where there are no numbers.
    void write(const Row& row);

private:
    void writeRow(const Row& row, std::size_t input);
    void writeDifference(const Row& row);

    Markup& _out;
    const DriveReport& _report;
};

/// Whether the role's numbers are quantities.
[[nodiscard]] bool hasFigures(Role role);
/// Whether the leaf identifies the subscriber or the phone, or is an address of it.
[[nodiscard]] bool isIdentifying(const CatalogueField& leaf);

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Observation.h"
#include "Tools/Decode/Paths/NodeSelection.h"
#include "Tools/Text/CSVText.h"
#include "Tools/Text/TextBuffer.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace velmora {

/// The places of observations as lines of samples show them, quoted once a leaf: CSV has the path or, where
/// the selection names it, the name; JSON has both.
class LeafTexts {
public:
    enum class Form : std::uint8_t { CSV, JSON };

    /// `selection` must outlive it.
    LeafTexts(const NodeSelection& selection, Form form, CSVGuard guard)
        : _selection(selection), _form(form), _guard(guard) {}

    /// Appends the cell or, after a comma, the members. `path`: which one of the selection selects it.
    void append(TextBuffer& out, const Observation& observation, std::size_t path);

private:
    /// What is between the numbers of rows.
    using Pieces = std::vector<std::string>;
    [[nodiscard]] Pieces piecesOf(const CatalogueField& leaf, std::size_t path) const;

    const NodeSelection& _selection;
    Form _form;
    CSVGuard _guard;
    std::vector<std::vector<Pieces>> _pieces; ///< by leaf and path
};

} // namespace velmora

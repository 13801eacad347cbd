// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/Evaluation/InputStore.h"
#include "LogGenerator/Observations/Catalogue.h"
#include "LogGenerator/Observations/Observation.h"
#include "LogGenerator/Observations/PathPattern.h"

#include <cstddef>
#include <cstdint>
#include <span>
#include <string>
#include <vector>

namespace velmora {

/// Passes what messages report to the inputs that are paths of the display. What a message removes, and the
/// rows of a list that it replaces, are unknown then.
class PathInputs {
public:
    /// The catalogue, which may grow, must outlive it. Precondition: rules have added their inputs.
    PathInputs(const Catalogue& catalogue, const InputStore& inputs);

    /// Whether an input reads the leaf.
    [[nodiscard]] bool reads(const CatalogueField& leaf) const;
    void update(const ObservedMessage& message, InputStore& inputs);

    /// Sets the value of the leaf in these rows.
    void set(const CatalogueField& leaf, std::span<const std::uint32_t> rows, const ReportedValue& value,
             InputStore& inputs);

    /// There is no value of the leaf any more, in any row.
    void remove(const CatalogueField& leaf, InputStore& inputs);

private:
    struct Use {
        std::uint32_t slot;
        PathPattern::Rows rows;
        bool isEach;
    };

    /// The inputs that the leaf is read by.
    [[nodiscard]] std::span<const Use> usesOf(const CatalogueField& leaf);
    void removeList(const CatalogueNode& list, InputStore& inputs);

    const Catalogue& _catalogue;
    struct Path {
        std::uint32_t slot;
        std::string path;
        bool isEach;
    };
    std::vector<Path> _paths;
    std::vector<std::vector<Use>> _uses;      ///< by index of the leaf, as far as leaves have been seen
    std::vector<const CatalogueField*> _used; ///< of these, those that an input reads
};

} // namespace velmora

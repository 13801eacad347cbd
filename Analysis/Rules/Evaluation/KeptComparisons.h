// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/Evaluation/InputStore.h"
#include "Analysis/Rules/Expression/Expression.h"

#include <cstdint>
#include <optional>
#include <span>
#include <vector>

namespace velmora {

/// The results of an expression's comparisons of one input with constants, such as
/// "radio.technology in ('LTE', 'NR')": texts are compared when the input is reported, not each time that the
/// expression is evaluated.
class KeptComparisons {
public:
    explicit KeptComparisons(const Expression& expression);

    /// Whether the node is such a comparison.
    [[nodiscard]] bool has(std::uint32_t node) const { return _results[node].input.has_value(); }
    /// What `compare` returned since its input was reported or removed last. `slots`: by input of the
    /// expression. Precondition: `has(node)`.
    template <class Compare>
    [[nodiscard]] double result(std::uint32_t node, const InputStore& inputs,
                                std::span<const std::uint32_t> slots, Compare compare) {
        Result& kept = _results[node];
        if (const std::uint64_t changes = inputs.slot(slots[*kept.input]).changes; kept.changes != changes) {
            kept.value = compare();
            kept.changes = changes;
        }
        return kept.value;
    }

private:
    struct Result {
        std::optional<std::uint32_t> input;        ///< of the expression
        std::uint64_t changes = ~std::uint64_t{0}; ///< of the slot, when it was compared
        double value = 0;
    };

    std::vector<Result> _results; ///< by node
};

} // namespace velmora

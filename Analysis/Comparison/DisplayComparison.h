// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Comparison/ObservedDisplay.h"

#include <optional>
#include <string_view>
#include <vector>

namespace velmora {

/// A place that two displays of a technology show differently.
struct DisplayDifference {
    enum class Change { Added, Gone, Changed };

    std::optional<ShownValue> before; ///< absent where it was added
    std::optional<ShownValue> after;  ///< absent where it is gone

    [[nodiscard]] Change change() const {
        return !before ? Change::Added : after ? Change::Changed : Change::Gone;
    }
    /// Of the two, the one that there is: the latter of both.
    [[nodiscard]] const ShownValue& any() const { return after ? *after : *before; }
    /// What has been added to the number; absent where not both are numbers, and for those that name
    /// something: the difference of two channels says nothing.
    [[nodiscard]] std::optional<double> difference() const;
};

/// "added", "gone", "changed".
[[nodiscard]] std::string_view nameOf(DisplayDifference::Change change);

/// The differences in the order of the second display, and what is gone at the place that it had in the first
/// one. Rows of lists are the same where what identifies them is, wherever they are in the list.
[[nodiscard]] std::vector<DisplayDifference> compareDisplays(const std::vector<ShownValue>& before,
                                                             const std::vector<ShownValue>& after);

} // namespace velmora

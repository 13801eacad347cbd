// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/Expression/RuleInput.h"
#include "LogGenerator/Observations/Catalogue.h"
#include "Platform/Result.h"

#include <cstddef>
#include <cstdint>
#include <functional>
#include <map>
#include <span>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace velmora {

/// The names by which rules read values, with the types that the catalogues of some technologies give them.
class InputNames {
public:
    enum class Further : std::uint8_t { AreMistakes, ArePossible };

    /// `further`: paths that the catalogues do not have, but that messages may name. The catalogues must
    /// outlive it.
    explicit InputNames(std::vector<const Catalogue*> catalogues, Further further = Further::AreMistakes)
        : _catalogues(std::move(catalogues)), _further(further) {}

    /// A role, "neighbour.detected", "radio.technology" or "radio.mode". The reason lists the nearest names.
    [[nodiscard]] static Result<RuleInput> named(std::string_view name);
    /// A path of a display. The reason lists the nearest paths. Of different ones at most `mostPaths`.
    [[nodiscard]] Result<RuleInput> at(std::string_view path) const;

    [[nodiscard]] std::span<const Catalogue* const> catalogues() const { return _catalogues; }

    static constexpr std::size_t mostPaths = 1024;

private:
    [[nodiscard]] Result<RuleInput> find(std::string_view path) const;

    std::vector<const Catalogue*> _catalogues;
    Further _further;
    mutable std::map<std::string, Result<RuleInput>, std::less<>> _paths; ///< looked up already
};

/// Whether messages of the technology can report it.
[[nodiscard]] bool canReport(const Catalogue& catalogue, const RuleInput& input);

/// Those of the names that resemble the text most, for a message: "serving.level, serving.cell".
[[nodiscard]] std::string nearestNames(std::string_view text, std::span<const std::string_view> names);

} // namespace velmora

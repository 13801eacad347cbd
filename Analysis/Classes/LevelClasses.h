// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Classes/LevelClass.h"
#include "Analysis/Picture/RadioTechnology.h"
#include "LogGenerator/Fields/Role.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// The limits between the classes of levels and qualities: of a role in each radio technology, and of paths
/// of the display. Values are in the catalogue's units. A `RuleSet` has those of its files.
class LevelClasses {
public:
    /// Absent for a value that is no finite number, where the radio technology is not known, and where no
    /// file has limits for the role in it. A neighbour's level and quality have the serving cell's limits.
    [[nodiscard]] std::optional<LevelClass> of(std::optional<RadioTechnology> technology, Role role,
                                               double value) const;
    /// The same of a place in the display, "/1x/Active Set/4", or of a leaf, "/1x/Active Set/*".
    [[nodiscard]] std::optional<LevelClass> ofPath(std::string_view path, double value) const;

    /// Null where there are none. Valid until the next limits are added.
    [[nodiscard]] const LevelLimits* limits(std::optional<RadioTechnology> technology, Role role) const;
    [[nodiscard]] const LevelLimits* limitsOfPath(std::string_view path) const;

    /// What the limits are for: a role in a radio technology, or a path.
    struct Subject {
        Role role = Role::None;
        RadioTechnology technology{}; ///< of a role
        std::string path{};           ///< where it is no role

        friend bool operator==(const Subject&, const Subject&) = default;
    };
    /// Where limits are from. Those of a higher layer replace those of a lower one.
    struct Origin {
        std::string file;
        std::uint32_t line = 0;
        int layer = 0;
    };
    /// Why the limits are not added; empty where they are, or where there are some of a higher layer.
    [[nodiscard]] std::string add(const Subject& subject, const LevelLimits& limits, const Origin& origin);

    /// How many subjects have limits.
    [[nodiscard]] std::size_t size() const { return _entries.size(); }
    /// How many of them are from that file.
    [[nodiscard]] std::size_t countFrom(std::string_view file) const;

    static constexpr std::size_t most = 1024;

private:
    struct Entry {
        Subject subject;
        LevelLimits limits;
        Origin origin;
    };

    std::vector<Entry> _entries;
};

} // namespace velmora

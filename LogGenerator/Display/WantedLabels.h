// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Display/PathRests.h"
#include "LogGenerator/Fields/Field.h"

#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>
#include <vector>

namespace velmora {

/// The labels of a section's dictionary, or of the rows of its list, to which paths lead. Each label is
/// compared with the paths once: like all that is named to a FieldVisitor, it is a constant.
class WantedLabels {
public:
    /// `place`: what the paths select of the section. `isList`: its node is a list.
    WantedLabels(const PathRests& place, bool isList);

    /// No path leads to anything of the section.
    [[nodiscard]] bool isEmpty() const { return _rests.isEmpty(); }
    [[nodiscard]] bool has(std::string_view label) const {
        if (_expected < _known.size() && isSame(_known[_expected].label, label))
            return _known[_expected++].isWanted;
        return find(label);
    }
    /// The indices of a table's fields whose labels are wanted.
    [[nodiscard]] std::span<const std::uint16_t> of(const Layout& layout) const {
        for (const Table& table : _tables)
            if (table.fields.data() == layout.fields.data() && table.fields.size() == layout.fields.size())
                return table.wanted;
        return add(layout);
    }

private:
    struct Known {
        std::string_view label;
        bool isWanted;
    };
    struct Table {
        std::span<const Field> fields;
        std::vector<std::uint16_t> wanted;
    };
    [[nodiscard]] static bool isSame(std::string_view a, std::string_view b) {
        return a.data() == b.data() && a.size() == b.size();
    }
    [[nodiscard]] bool find(std::string_view label) const;
    [[nodiscard]] std::span<const std::uint16_t> add(const Layout& layout) const;

    PathRests _rests; ///< of the dictionary, or of any row
    mutable std::vector<Known> _known;
    mutable std::vector<Table> _tables;
    mutable std::size_t _expected = 0; ///< the label after the one found last: records name them in order
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Catalogue.h"

#include <cstdint>
#include <map>
#include <string_view>
#include <tuple>
#include <vector>

namespace velmora {

/// A catalogue's leaves by what they are read from.
class LeafIndex {
public:
    using Leaves = std::vector<const CatalogueField*>;

    explicit LeafIndex(const Catalogue& catalogue);

    /// The leaves that show the field of that list (null: of none) in records of that code, in the section.
    [[nodiscard]] const Leaves& of(std::string_view section, std::uint32_t code, const List* list,
                                   const Field& field) const;
    /// The nodes at which the section shows the list.
    [[nodiscard]] std::vector<const CatalogueNode*> listsOf(std::string_view section, const List& list) const;

private:
    using Key = std::tuple<std::string_view, std::uint32_t, const List*, const Field*>;

    std::map<Key, Leaves> _leaves;
    std::map<std::pair<std::string_view, const List*>, std::vector<const CatalogueNode*>> _lists;
};

} // namespace velmora

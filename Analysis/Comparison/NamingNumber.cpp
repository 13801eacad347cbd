// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Comparison/NamingNumber.h"

#include <algorithm>

namespace velmora {

bool isNamingNumber(Role role) {
    switch (role) {
    case Role::ServingArea:
    case Role::ServingCell:
    case Role::ServingChannel:
    case Role::ServingPhysicalCell:
    case Role::NeighbourChannel:
    case Role::NeighbourPhysicalCell: return true;
    default: return false;
    }
}

bool isNamingNumber(const CatalogueField& leaf) {
    return isNamingNumber(leaf.role) || leaf.identity != Identity::None ||
           std::find(leaf.keys.begin(), leaf.keys.end(), leaf.node->name()) != leaf.keys.end();
}

} // namespace velmora

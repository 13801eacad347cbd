// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/ChartedLeaf.h"

namespace velmora {

std::string_view nameOf(ReportChart chart) {
    switch (chart) {
    case ReportChart::Level: return "level";
    case ReportChart::Quality: return "quality";
    case ReportChart::DataRate: return "data rate";
    case ReportChart::ErrorRate: return "error rate";
    case ReportChart::None: break;
    }
    return "";
}

ReportChart chartOf(const CatalogueField& leaf) {
    if (leaf.kind != ObservedKind::Number || !leaf.sameAs.empty())
        return ReportChart::None;
    switch (leaf.role) {
    case Role::ServingLevel:
    case Role::NeighbourLevel: return ReportChart::Level;
    case Role::ServingQuality:
    case Role::NeighbourQuality: return ReportChart::Quality;
    case Role::DataRate: return ReportChart::DataRate;
    case Role::BlockErrorRate: return ReportChart::ErrorRate;
    default: break;
    }
    // A share of errors without the role is that of one radio technology of several.
    const bool isErrorRate = leaf.unit == Unit::Percent && leaf.path.ends_with("Error Rate");
    return isErrorRate ? ReportChart::ErrorRate : ReportChart::None;
}

bool isNeighbour(const CatalogueField& leaf) {
    return leaf.role == Role::NeighbourLevel || leaf.role == Role::NeighbourQuality;
}

} // namespace velmora

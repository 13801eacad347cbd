// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/StartContexts.h"

#include "Analysis/Picture/Technologies/TechnologyTable.h"
#include "Export/Report/ReportEvents.h"

namespace velmora {

StartContexts::StartContexts(const Catalogue& catalogue, const ReportEvents& events)
    : _events(events), _detector(catalogue, technologyTable(catalogue.technology()).detectors,
                                 ContextsDetector::AtStart::Events) {}

void StartContexts::happened(const Event& event) {
    _rows.push_back({event.time, event.evidence.empty() ? MessageNumber() : event.evidence.front(),
                     _events.shownText(event)});
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Detectors/BuiltIn.h"

#include "Analysis/Detectors/AreaUpdates.h"
#include "Analysis/Detectors/Calls.h"
#include "Analysis/Detectors/Contexts.h"
#include "Analysis/Detectors/ModeMachine.h"
#include "Analysis/Detectors/Reselections.h"
#include "Analysis/Detectors/SIM.h"
#include "Analysis/Detectors/Service.h"
#include "Analysis/Detectors/ServingCell.h"
#include "Analysis/Detectors/StateMachines.h"
#include "Analysis/Detectors/StoredAreas.h"
#include "Analysis/Picture/Technologies/TechnologyTable.h"

namespace velmora {

std::vector<std::unique_ptr<Detector>> builtInDetectors(const Catalogue& catalogue) {
    const DetectorTable& table = technologyTable(catalogue.technology()).detectors;
    std::vector<std::unique_ptr<Detector>> detectors;
    // In the order in which a message's events are passed on.
    detectors.push_back(std::make_unique<ServiceDetector>(catalogue, table));
    detectors.push_back(std::make_unique<StateMachinesDetector>(catalogue, table));
    if (!table.modeMachine.empty())
        detectors.push_back(std::make_unique<ModeMachineDetector>(table.modeMachine));
    detectors.push_back(std::make_unique<ServingCellDetector>());
    detectors.push_back(std::make_unique<ReselectionsDetector>());
    detectors.push_back(std::make_unique<AreaUpdatesDetector>(catalogue, table));
    detectors.push_back(std::make_unique<StoredAreasDetector>(catalogue, table));
    detectors.push_back(std::make_unique<CallsDetector>(catalogue, table));
    detectors.push_back(std::make_unique<ContextsDetector>(catalogue, table));
    detectors.push_back(std::make_unique<SIMDetector>(catalogue, table));
    return detectors;
}

} // namespace velmora

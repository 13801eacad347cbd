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
#include "Analysis/Detectors/TableDetectors.h"
#include "Analysis/Picture/Technologies/TechnologyTable.h"

namespace velmora {

namespace {

using Paths = std::vector<std::string_view>;

/// What the rows of a table have in that member, and in those.
template <class Rows, class... Members>
Paths pathsOf(const Rows& rows, Members... members) {
    Paths paths;
    for (const auto& row : rows)
        for (const std::string_view path : {row.*members...})
            if (!path.empty())
                paths.push_back(path);
    return paths;
}

template <class Rows>
Paths pathsOfValues(const Rows& rows) {
    Paths paths;
    for (const auto& row : rows)
        paths.push_back(row.value.path);
    return paths;
}

std::unique_ptr<Detector> tableDetectors(const Catalogue& catalogue, const DetectorTable& table) {
    auto all = std::make_unique<TableDetectors>(catalogue);
    all->add(std::make_unique<ServiceDetector>(catalogue, table), pathsOfValues(table.services));
    all->add(std::make_unique<StateMachinesDetector>(catalogue, table),
             pathsOf(table.machines, &MachineRow::path, &MachineRow::subPath));
    all->add(std::make_unique<AreaUpdatesDetector>(catalogue, table),
             pathsOf(table.areaUpdates, &AreaUpdateRow::statePath, &AreaUpdateRow::statusPath));
    all->add(std::make_unique<StoredAreasDetector>(catalogue, table),
             pathsOf(table.storedAreas, &StoredAreaRow::path));
    all->add(std::make_unique<CallsDetector>(catalogue, table), pathsOfValues(table.calls));
    all->add(std::make_unique<SIMDetector>(catalogue, table), {table.sims.begin(), table.sims.end()});
    return all;
}

} // namespace

std::vector<std::unique_ptr<Detector>> builtInDetectors(const Catalogue& catalogue) {
    const DetectorTable& table = technologyTable(catalogue.technology()).detectors;
    std::vector<std::unique_ptr<Detector>> detectors;
    // In the order in which a message's events are passed on.
    detectors.push_back(tableDetectors(catalogue, table));
    if (!table.modeMachine.empty())
        detectors.push_back(std::make_unique<ModeMachineDetector>(table.modeMachine));
    detectors.push_back(std::make_unique<ServingCellDetector>());
    detectors.push_back(std::make_unique<ReselectionsDetector>());
    if (!table.contexts.lists.empty())
        detectors.push_back(std::make_unique<ContextsDetector>(catalogue, table));
    return detectors;
}

} // namespace velmora

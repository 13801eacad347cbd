// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Picture/Technologies/TechnologyTable.h"

namespace velmora {

namespace {

constexpr TechnologyRow leaves[] = {{"/", RadioTechnology::TDSCDMA}};

// 3GPP TS 25.331 7.1; only in CELL_DCH does the network choose the cell (TS 25.304 5.2.6).
constexpr ModeRow states[] = {
    {.raw = 0, .mode = RadioMode::Idle},
    {.raw = 1, .mode = RadioMode::Idle},      // connecting
    {.raw = 2, .mode = RadioMode::Connected}, // CELL_FACH
    {.raw = 3, .mode = RadioMode::Connected, .isMovedByNetwork = true},
    {.raw = 4, .mode = RadioMode::Connected}, // CELL_PCH
    {.raw = 5, .mode = RadioMode::Connected}, // URA_PCH
};
constexpr ModeTable modes[] = {{"/Serving Cell/RRC Info/State", states}};

constexpr NeighbourRow neighbours[] = {{"/Neighbors/Neighbor Cell List/*/Status", NeighbourPart::Set}};

constexpr MachineRow machines[] = {{EventKind::RadioState, "RRC", "/Serving Cell/RRC Info/State"}};

constexpr std::string_view access = "/Serving Cell/Serving Cell Info/Allowed Access";
constexpr ServiceRow services[] = {{{access, 0}, Service::Normal}, {{access, 1}, Service::Limited}};

// Where it is registered the SIM knows, and no other record does.
constexpr StoredAreaRow storedAreas[] = {{"location", "/SIM Info/EF-LOCI"}};

constexpr std::string_view contextLists[] = {"/PDP Context Info"};
constexpr std::string_view addresses[] = {"PDP Address"};
constexpr std::string_view sims[] = {"/SIM Info/EF-ICCID"};

} // namespace

constinit const TechnologyTable technologies::ostrelUTRAN2{
    .name = "Ostrel_UTRAN2",
    .technologies = leaves,
    .modes = modes,
    .neighbours = neighbours,
    .activeSet = 0,
    .detectedSet = 2,
    .detectors = {.machines = machines,
                  .services = services,
                  .storedAreas = storedAreas,
                  .contexts = {.lists = contextLists, .key = "Context ID", .addresses = addresses},
                  .sims = sims}};

} // namespace velmora

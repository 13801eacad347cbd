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

} // namespace

constinit const TechnologyTable technologies::ostrelUTRAN2{.name = "Ostrel_UTRAN2",
                                                           .technologies = leaves,
                                                           .modes = modes,
                                                           .neighbours = neighbours,
                                                           .activeSet = 0,
                                                           .detectedSet = 2};

} // namespace velmora

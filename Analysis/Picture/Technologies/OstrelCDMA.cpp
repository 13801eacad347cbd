// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Picture/Technologies/TechnologyTable.h"

namespace velmora {

namespace {

constexpr TechnologyRow leaves[] = {
    {"/Overview/1x State", RadioTechnology::CDMA1x},
    {"/1x", RadioTechnology::CDMA1x},
    {"/System", RadioTechnology::CDMA1x},
    {"/Overview/EV-DO State", RadioTechnology::EVDO},
    {"/Overview/Forward Link Rate", RadioTechnology::EVDO},
    {"/EV-DO", RadioTechnology::EVDO},
};

constexpr ModeRow oneXStates[] = {
    {.raw = 0, .mode = RadioMode::Off},
    {.raw = 2, .mode = RadioMode::Searching}, // initial
    {.raw = 3, .mode = RadioMode::Searching}, // acquisition
    {.raw = 4, .mode = RadioMode::Searching}, // sync
    {.raw = 6, .mode = RadioMode::Idle},      // paging
    {.raw = 7, .mode = RadioMode::Idle},      // asleep between two pages
    {.raw = 8, .mode = RadioMode::Connected, .isMovedByNetwork = true},
    {.raw = 11, .mode = RadioMode::Searching}, // powered up
};

constexpr ModeRow evdoStates[] = {
    {.raw = 0, .mode = RadioMode::Off},
    {.raw = 1, .mode = RadioMode::Searching}, // acquisition
    {.raw = 2, .mode = RadioMode::Searching}, // sync
    {.raw = 3, .mode = RadioMode::Idle},
    {.raw = 4, .mode = RadioMode::Idle}, // access
    {.raw = 5, .mode = RadioMode::Connected, .isMovedByNetwork = true},
};

constexpr ModeTable modes[] = {{"/Overview/1x State", oneXStates}, {"/Overview/EV-DO State", evdoStates}};

constexpr std::string_view ignored[] = {"/Overview/Reverse Link Rate"};

constexpr MachineRow machines[] = {
    {EventKind::RadioState, "1x", "/Overview/1x State"},
    {EventKind::RadioState, "EV-DO", "/Overview/EV-DO State"},
    {EventKind::EVDOSession, "session", "/EV-DO/Session State"},
};

constexpr CallRow calls[] = {{{"/Overview/1x State", 8}, CallState::Active}}; // traffic

} // namespace

constinit const TechnologyTable technologies::ostrelCDMA{.name = "Ostrel_CDMA",
                                                         .technologies = leaves,
                                                         .modes = modes,
                                                         .ignored = ignored,
                                                         .isHybrid = true,
                                                         .hasZerosForNone = true,
                                                         .searched = RadioTechnology::EVDO,
                                                         .detectors = {.machines = machines, .calls = calls}};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Picture/Technologies/TechnologyTable.h"

namespace velmora {

namespace {

constexpr TechnologyRow leaves[] = {
    {"/GSM", RadioTechnology::GSM},
    {"/UMTS", RadioTechnology::UMTS},
    {"/Reselection/UMTS Set", RadioTechnology::UMTS},
};

// The RR states that the modem reports. Inactive (0) says nothing: GSM is inactive on UMTS too. A phone in
// packet transfer that reselects has a state of its own.
constexpr ModeRow rrStates[] = {
    {.raw = 1, .mode = RadioMode::Connected, .isMovedByNetwork = true}, // going active
    {.raw = 2, .mode = RadioMode::Connected, .isMovedByNetwork = true}, // going inactive
    {.raw = 3, .mode = RadioMode::Searching},                           // cell selection
    {.raw = 4, .mode = RadioMode::Searching},                           // list of networks
    {.raw = 5, .mode = RadioMode::Idle},
    {.raw = 6, .mode = RadioMode::Idle},                                 // reselection
    {.raw = 7, .mode = RadioMode::Idle},                                 // connection pending
    {.raw = 8, .mode = RadioMode::Searching},                            // choosing a cell
    {.raw = 9, .mode = RadioMode::Connected, .isMovedByNetwork = true},  // data transfer
    {.raw = 10, .mode = RadioMode::Searching},                           // no channels
    {.raw = 11, .mode = RadioMode::Connected, .isMovedByNetwork = true}, // release
    {.raw = 12, .mode = RadioMode::Searching},                           // early camped
    {.raw = 13, .mode = RadioMode::Connected, .isMovedByNetwork = true}, // handover from UMTS
    {.raw = 14, .mode = RadioMode::Idle},                                // reselection from UMTS
    {.raw = 15, .mode = RadioMode::Searching},
    {.raw = 18, .mode = RadioMode::Idle},                                // reselection to UMTS
    {.raw = 19, .mode = RadioMode::Connected, .isMovedByNetwork = true}, // handover to UMTS
    {.raw = 20, .mode = RadioMode::Connected},                           // reestablishment
    {.raw = 21, .mode = RadioMode::Connected, .isMovedByNetwork = true}, // ordered from UMTS
};

// 3GPP TS 25.331 7.1; only in CELL_DCH does the network choose the cell (TS 25.304 5.2.6).
constexpr ModeRow rrcStates[] = {
    {.raw = 0, .mode = RadioMode::Idle},
    {.raw = 1, .mode = RadioMode::Idle},      // connecting
    {.raw = 2, .mode = RadioMode::Connected}, // CELL_FACH
    {.raw = 3, .mode = RadioMode::Connected, .isMovedByNetwork = true},
    {.raw = 4, .mode = RadioMode::Connected}, // CELL_PCH
    {.raw = 5, .mode = RadioMode::Connected}, // URA_PCH
};

constexpr ModeRow registrationStates[] = {{.raw = 6, .mode = RadioMode::Off}}; // offline

constexpr ModeTable modes[] = {
    {"/GSM/GSM RR Info/RR State", rrStates},
    {"/UMTS/UMTS RR Info/RRC State", rrcStates},
    {"/Registration/Process CS/MM Service State", registrationStates},
};

} // namespace

constinit const TechnologyTable technologies::ostrelGSM{
    .name = "Ostrel_GSM", .technologies = leaves, .modes = modes};

} // namespace velmora

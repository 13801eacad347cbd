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

constexpr MachineRow machines[] = {
    {EventKind::RadioState, "RR", "/GSM/GSM RR Info/RR State"},
    {EventKind::RadioState, "RRC", "/UMTS/UMTS RR Info/RRC State"},
    {EventKind::MobilityState, "MM", "/Registration/Process CS/MM State",
     "/Registration/Process CS/MM Sub State"},
    {EventKind::MobilityState, "GMM", "/Registration/Process PS/MM State",
     "/Registration/Process PS/MM Sub State"},
    {EventKind::RegistrationState, "registration", "/Registration/Process CS/MM Service State"},
};

constexpr std::string_view serviceType = "/Registration/Serving PLMN/Service Type";
constexpr std::string_view subState = "/Registration/Process CS/MM Sub State";
constexpr ServiceRow services[] = {
    {{serviceType, 0}, Service::None},    {{serviceType, 1}, Service::Normal},
    {{serviceType, 2}, Service::Normal},  {{serviceType, 3}, Service::Normal},
    {{serviceType, 4}, Service::Limited}, {{subState, 3}, Service::Limited},
    {{subState, 6}, Service::None},       {{subState, 8}, Service::Normal},
};

constexpr std::string_view mmState = "/Registration/Process CS/MM State";
constexpr CallRow calls[] = {
    {{mmState, 6}, CallState::Active},
    {{mmState, 17}, CallState::Reestablishing},
    {{mmState, 21}, CallState::Reestablishing},
    {{mmState, 22}, CallState::Reestablishing},
    {{"/GSM/GSM RR Info/RR State", 20}, CallState::Reestablishing},
};

// 3GPP TS 24.008 4.1.2.2, 4.1.3.2: roaming, location or routing area not allowed.
constexpr std::int64_t refused[] = {2, 3};
constexpr AreaUpdateRow areaUpdates[] = {
    {"location", mmState, 3, 10, "/Registration/Process CS/LU Reject Cause", 0, refused},
    {"routing", "/Registration/Process PS/MM State", 5, -1, "/Registration/Process PS/Attach Reject Cause", 0,
     refused},
};

constexpr std::string_view contextLists[] = {"/Packet Data/PDP Context Info"};
constexpr std::string_view addresses[] = {"PDP Address"};
constexpr std::string_view sims[] = {"/SIM Info/EF-ICCID"};

} // namespace

constinit const TechnologyTable technologies::ostrelGSM{
    .name = "Ostrel_GSM",
    .technologies = leaves,
    .modes = modes,
    .detectors = {.machines = machines,
                  .services = services,
                  .calls = calls,
                  .areaUpdates = areaUpdates,
                  .contexts = {.lists = contextLists, .key = "Context ID", .addresses = addresses},
                  .sims = sims}};

} // namespace velmora

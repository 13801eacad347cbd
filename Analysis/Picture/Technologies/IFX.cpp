// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Picture/Technologies/TechnologyTable.h"

namespace velmora {

namespace {

constexpr TechnologyRow leaves[] = {{"/", RadioTechnology::GSM}};

// In packet transfer the phone reselects (3GPP TS 44.060 5.5.1).
constexpr ModeRow states[] = {
    {0, "Searching", RadioMode::Searching},
    {0, "Limited Service", RadioMode::Idle},
    {0, "Idle", RadioMode::Idle},
    {0, "Registering", RadioMode::Idle},
    {0, "Call", RadioMode::Connected, true},
    {0, "Packet Transfer", RadioMode::Connected},
};
constexpr ModeTable modes[] = {{"/Registration/State", states}, {"/Registration", states}};

constexpr std::string_view state = "/Registration/State";
constexpr std::string_view onlyState = "/Registration"; // a dictionary of one entry is shown as its value
constexpr MachineRow machines[] = {
    {EventKind::RegistrationState, "registration", state},
    {EventKind::RegistrationState, "registration", onlyState},
};

constexpr ServiceRow services[] = {
    {{onlyState, 0, "Searching"}, Service::None},
    {{state, 0, "Searching"}, Service::None},
    {{onlyState, 0, "Limited Service"}, Service::Limited},
    {{state, 0, "Limited Service"}, Service::Limited},
    {{onlyState, 0, "Registering"}, Service::Normal},
    {{state, 0, "Registering"}, Service::Normal},
    {{state, 0, "Idle"}, Service::Normal},
    {{state, 0, "Call"}, Service::Normal},
    {{state, 0, "Packet Transfer"}, Service::Normal},
};

constexpr CallRow calls[] = {{{state, 0, "Call"}, CallState::Active}};

constexpr StoredAreaRow storedAreas[] = {{"location", "/Registration/LAC"}};

constexpr std::string_view contextLists[] = {"/Packet Data/Contexts", "/Packet Data"};
constexpr std::string_view addresses[] = {"Address"};
constexpr std::string_view sims[] = {"/SIM/ICCID", "/SIM"};

} // namespace

constinit const TechnologyTable technologies::ifx{.name = "IFX",
                                                  .technologies = leaves,
                                                  .modes = modes,
                                                  .detectors = {.machines = machines,
                                                                .services = services,
                                                                .calls = calls,
                                                                .storedAreas = storedAreas,
                                                                .contexts = {.lists = contextLists,
                                                                             .key = "Context ID",
                                                                             .addresses = addresses,
                                                                             .isInEveryMessage = true},
                                                                .sims = sims}};

} // namespace velmora

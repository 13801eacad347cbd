// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Picture/Technologies/TechnologyTable.h"

namespace velmora {

namespace {

// Of the modem's states these alone say what the radio does: "connected" is packet data, not a radio
// connection.
constexpr ModeRow modemStates[] = {
    {.raw = 3, .mode = RadioMode::Off}, // disabled
    {.raw = 7, .mode = RadioMode::Searching},
};
constexpr ModeTable modes[] = {{"/Modem/Modem State", modemStates}};

constexpr TechnologyNumber numbers[] = {
    {1, RadioTechnology::GSM}, {2, RadioTechnology::UMTS}, {3, RadioTechnology::TDSCDMA},
    {4, RadioTechnology::LTE}, {5, RadioTechnology::NR},   {6, RadioTechnology::CDMA1x},
};

constexpr NeighbourRow neighbours[] = {
    {"/Neighbor Cells/Cells/*/Radio Technology", NeighbourPart::Technology}};

constexpr std::string_view ignored[] = {"/Traffic/Bearers/*/Uplink Rate"};

constexpr std::string_view registration = "/Registration/Registration State";
constexpr MachineRow machines[] = {{EventKind::RegistrationState, "registration", registration}};

// 3GPP TS 27.007 7.2. Denied, a phone may still make emergency calls; idle, it does not look for a network.
constexpr ServiceRow services[] = {
    {{registration, 0}, Service::Normal},   {{registration, 1}, Service::Normal},
    {{registration, 2}, Service::None},     {{registration, 3}, Service::Limited},
    {{registration, 5}, Service::Normal},   {{registration, 6}, Service::Normal},
    {{registration, 7}, Service::Normal},   {{registration, 8}, Service::Limited},
    {{registration, 9}, Service::Normal},   {{registration, 10}, Service::Normal},
    {{registration, 11}, Service::Limited},
};

constexpr std::string_view contextLists[] = {"/Packet Data Contexts/Contexts"};
constexpr std::string_view addresses[] = {"IPv4 Address", "IPv6 Address"};
constexpr std::string_view sims[] = {"/SIM/ICCID"};

} // namespace

constinit const TechnologyTable technologies::modem{.name = "Modem",
                                                    .modes = modes,
                                                    .neighbours = neighbours,
                                                    .servingTechnology = "/Serving Cell/Radio Technology",
                                                    .technologyNumbers = numbers,
                                                    .ignored = ignored,
                                                    .detectors = {.machines = machines,
                                                                  .services = services,
                                                                  .contexts = {.lists = contextLists,
                                                                               .key = "Bearer",
                                                                               .addresses = addresses,
                                                                               .connected = "Connected"},
                                                                  .sims = sims}};

} // namespace velmora

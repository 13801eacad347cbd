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

} // namespace

constinit const TechnologyTable technologies::modem{.name = "Modem",
                                                    .modes = modes,
                                                    .neighbours = neighbours,
                                                    .servingTechnology = "/Serving Cell/Radio Technology",
                                                    .technologyNumbers = numbers,
                                                    .ignored = ignored};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Picture/Technologies/TechnologyTable.h"

namespace velmora {

namespace {

constexpr TechnologyRow leaves[] = {{"/", RadioTechnology::LTE}};

// No record reports the RRC state, but each of these is sent in one of them alone.
constexpr ModeEvidence evidence[] = {
    {"/Serving Cell/Serving Cell Measurements/E-ARFCN", RadioMode::Idle},
    {"/Reselection/Reselection Candidates/Serving EARFCN", RadioMode::Idle},
    {"/Connected Mode/Connected mode LTE Intra-frequency Measurement/E-ARFCN", RadioMode::Connected},
};

constexpr NeighbourRow neighbours[] = {
    {"/Idle Mode Neighbors/Neighbor Measurements/E-ARFCN", NeighbourPart::Channel},
    {"/Connected Mode/Connected mode LTE Intra-frequency Measurement/E-ARFCN", NeighbourPart::Channel},
    {"/Connected Mode/Detected Cells", NeighbourPart::DetectedCell},
};

// Reserved for when there is no valid tracking area identity (3GPP TS 23.003 19.4.2.3).
constexpr std::int64_t noAreas[] = {0, 0xFFFE};

// Where it is registered the SIM knows, and no other record does.
constexpr StoredAreaRow storedAreas[] = {{"location", "/SIM Info/EF-LOCI"}};

constexpr std::string_view contextLists[] = {"/Packet Data/PDP Context Info"};
constexpr std::string_view addresses[] = {"PDP Address"};
constexpr std::string_view sims[] = {"/SIM Info/EF-ICCID"};

} // namespace

constinit const TechnologyTable technologies::ostrelLTE{
    .name = "Ostrel_LTE",
    .technologies = leaves,
    .evidence = evidence,
    .neighbours = neighbours,
    .noAreas = noAreas,
    .detectors = {.storedAreas = storedAreas,
                  .contexts = {.lists = contextLists, .key = "Context ID", .addresses = addresses},
                  .sims = sims,
                  .modeMachine = "RRC"}};

} // namespace velmora

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

} // namespace

constinit const TechnologyTable technologies::ostrelLTE{
    .name = "Ostrel_LTE", .technologies = leaves, .evidence = evidence, .neighbours = neighbours};

} // namespace velmora

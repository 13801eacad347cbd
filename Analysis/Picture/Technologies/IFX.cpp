// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Picture/Technologies/TechnologyTable.h"

namespace velmora {

namespace {

constexpr TechnologyRow leaves[] = {{"/", RadioTechnology::GSM}};

// In packet transfer a phone reselects by itself unless the network orders otherwise (3GPP TS 44.060 5.6),
// and the display does not show which.
constexpr ModeRow states[] = {
    {0, "Searching", RadioMode::Searching},
    {0, "Limited Service", RadioMode::Idle},
    {0, "Idle", RadioMode::Idle},
    {0, "Call", RadioMode::Connected, true},
};
constexpr ModeTable modes[] = {{"/Registration/State", states}, {"/Registration", states}};

} // namespace

constinit const TechnologyTable technologies::ifx{.name = "IFX", .technologies = leaves, .modes = modes};

} // namespace velmora

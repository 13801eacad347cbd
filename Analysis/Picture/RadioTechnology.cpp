// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Picture/RadioTechnology.h"

#include <array>

namespace velmora {

namespace {

struct Names {
    std::string_view technology;
    std::string_view channel;
    std::string_view physicalCell;
};

/// By the enumeration.
constexpr std::array<Names, radioTechnologies> names{{
    {"GSM", "ARFCN", "BSIC"},
    {"UMTS", "UARFCN", "PSC"},
    {"TD-SCDMA", "UARFCN", "cell parameter"},
    {"LTE", "EARFCN", "PCI"},
    {"NR", "NR-ARFCN", "PCI"},
    {"CDMA2000 1x", "channel", "PN"},
    {"EV-DO", "channel", "PN"},
}};

const Names& namesOf(RadioTechnology technology) {
    return names[static_cast<std::size_t>(technology)];
}

} // namespace

std::string_view nameOf(RadioTechnology technology) {
    return namesOf(technology).technology;
}

std::string_view channelNameOf(RadioTechnology technology) {
    return namesOf(technology).channel;
}

std::string_view physicalCellNameOf(RadioTechnology technology) {
    return namesOf(technology).physicalCell;
}

std::string_view nameOf(RadioMode mode) {
    static constexpr std::array<std::string_view, 4> modes{"off", "searching", "idle", "connected"};
    return modes[static_cast<std::size_t>(mode)];
}

} // namespace velmora

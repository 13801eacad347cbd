// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/PilotList.h"

#include "LogGenerator/Fields/NumberFormat.h"

#include <cmath>

namespace velmora::C2K {

std::string decibels(double ratio) {
    return std::string(NumberText("%+.2f dB", 10 * std::log10(ratio)).text());
}

} // namespace velmora::C2K

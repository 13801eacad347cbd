// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Fix.h"

#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// What lies between "$" and "*" as a sentence, with its checksum and the end of the line.
[[nodiscard]] std::string nmeaSentence(std::string_view content);

/// A fix as sentences of a receiver of several systems: GGA and RMC, and GST where there is an estimate of
/// the error, which is split evenly among latitude and longitude. Angles have 5 decimals of a minute, which
/// is 2 cm, speeds 2 decimals of a knot, times milliseconds. What is absent is an empty field. Their time is
/// that of the fix, rounded down.
[[nodiscard]] std::vector<std::string> nmeaSentences(const Fix& fix);

} // namespace velmora

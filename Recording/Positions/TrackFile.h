// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Platform/Fix.h"
#include "Platform/Result.h"

#include <cstddef>
#include <optional>
#include <string_view>
#include <vector>

namespace velmora {

/// The most bytes of a track file that are read: 10 h of a fix a second are 5 MB.
inline constexpr std::size_t maximumTrackFile = std::size_t{256} << 20;

/// The fixes of a track file, in the order of their times: of a GPX file (1.0 or 1.1) the points of its
/// tracks that have a time; of NMEA sentences, one a line, those that make fixes, by the dates of RMC or ZDA.
/// Which one it is, its first character says. Fails where there is no fix with a time; the reason names the
/// line where one is to blame.
[[nodiscard]] Result<std::vector<Fix>> fixesOfTrackFile(std::string_view content);

/// The number of the line that the byte at that offset is in, from 1.
[[nodiscard]] std::size_t lineAt(std::string_view content, std::size_t offset);

[[nodiscard]] Result<std::vector<Fix>> fixesOfGPX(std::string_view content);
[[nodiscard]] Result<std::vector<Fix>> fixesOfNMEA(std::string_view content);

/// A date and time of XML Schema: "2026-11-22T09:05:07.25Z", "2026-11-22T10:05:07+01:00". Without a zone it
/// is UTC. Years 1980 to 2200.
[[nodiscard]] std::optional<Time> timeOfXML(std::string_view text);

} // namespace velmora

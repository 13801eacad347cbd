// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>

namespace velmora {

class DriveReport;
class Markup;

/// The way that the recording went, as a picture without a map: with a scale, north up.
void writeTrack(Markup& out, const DriveReport& report);
/// The same for the page's script, as JSON.
void writeTrackData(Markup& out, const DriveReport& report, std::int64_t base_ms);
/// "12.345 km", "850 m".
void writeDistance(Markup& out, double metres);

} // namespace velmora

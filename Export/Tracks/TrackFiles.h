// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Tracks/TrackData.h"

#include <string>

/// A track as the files that maps read. Each is UTF-8 and complete.
namespace velmora::trackFiles {

/// GPX 1.1: a track of the fixes, a segment up to each gap; speed, course and the attributes as extensions of
/// a point; events as way points.
[[nodiscard]] std::string gpx(const TrackData& track);

/// GeoJSON (RFC 7946): a point for each fix with the attributes as its properties, a line for each segment,
/// cut where it crosses the date line, a point for each event. "feature" says which of them one is. An event
/// whose place is unknown has the geometry null.
[[nodiscard]] std::string geoJSON(const TrackData& track);

/// KML 2.2: lines in the colour of the first attribute, numbers in five classes of the same width between the
/// smallest and the largest, other values in a colour each; a place mark for each event.
[[nodiscard]] std::string kml(const TrackData& track);

} // namespace velmora::trackFiles

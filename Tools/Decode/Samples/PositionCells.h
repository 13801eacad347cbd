// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Tracks/Geodesy.h"
#include "Analysis/Tracks/Position.h"
#include "Tools/Text/TextBuffer.h"

#include <optional>
#include <string_view>

namespace velmora {

/// The columns of a sample's position, after a comma.
inline constexpr std::string_view positionColumns =
    ",latitude,longitude,altitude,speed,fix_age,hdop,deviation";

/// Their cells, each after a comma, empty where the value is absent: degrees with 7 decimals, metres, metres
/// a second, seconds.
void appendPositionCells(TextBuffer& out, const std::optional<Position>& position);

/// The columns of a place, and its two cells, each after a comma; empty where it is absent.
inline constexpr std::string_view placeColumns = ",latitude,longitude";
void appendPlaceCells(TextBuffer& out, const std::optional<Coordinates>& place);
/// The same as members of a JSON object, each after a comma; nothing where it is absent.
void appendPlaceMembers(TextBuffer& out, const std::optional<Coordinates>& place);

/// A position as members of a JSON object, each after a comma: those alone that there are.
void appendPositionMembers(TextBuffer& out, const std::optional<Position>& position);

} // namespace velmora

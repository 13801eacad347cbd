// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Samples/PositionCells.h"

#include <array>
#include <chrono>
#include <cstddef>
#include <cstdio>

namespace velmora {

namespace {

/// A centimetre.
constexpr int degreeDecimals = 7;

struct Cell {
    std::string_view member;
    int decimals;
    std::optional<double> value;
};

std::array<Cell, 7> cellsOf(const Position& position) {
    const Fix& fix = position.fix;
    return {{{"latitude", degreeDecimals, fix.latitude},
             {"longitude", degreeDecimals, fix.longitude},
             {"altitude", 2, fix.altitude_m},
             {"speed", 2, fix.speed_mps},
             {"fixAge", 3, std::chrono::duration<double>(position.age).count()},
             {"hdop", 2, fix.hdop},
             {"deviation", 2, fix.deviation_m}}};
}

void appendDecimals(TextBuffer& out, double number, int decimals) {
    constexpr std::size_t longest = 40;
    char* const room = out.room(longest);
    const int length = std::snprintf(room, longest, "%.*f", decimals, number);
    if (length > 0 && static_cast<std::size_t>(length) < longest)
        out.advance(static_cast<std::size_t>(length));
}

} // namespace

void appendPositionCells(TextBuffer& out, const std::optional<Position>& position) {
    for (const Cell& cell : cellsOf(position.value_or(Position()))) {
        out.append(',');
        if (position && cell.value)
            appendDecimals(out, *cell.value, cell.decimals);
    }
}

void appendPlaceCells(TextBuffer& out, const std::optional<Coordinates>& place) {
    out.append(',');
    if (place)
        appendDecimals(out, place->latitude, degreeDecimals);
    out.append(',');
    if (place)
        appendDecimals(out, place->longitude, degreeDecimals);
}

void appendPlaceMembers(TextBuffer& out, const std::optional<Coordinates>& place) {
    if (!place)
        return;
    out.append(",\"latitude\":");
    appendDecimals(out, place->latitude, degreeDecimals);
    out.append(",\"longitude\":");
    appendDecimals(out, place->longitude, degreeDecimals);
}

void appendPositionMembers(TextBuffer& out, const std::optional<Position>& position) {
    if (!position)
        return;
    for (const Cell& cell : cellsOf(*position)) {
        if (!cell.value)
            continue;
        out.append(",\"");
        out.append(cell.member);
        out.append("\":");
        appendDecimals(out, *cell.value, cell.decimals);
    }
}

} // namespace velmora

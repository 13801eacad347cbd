// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/DriveView/NeighbourRows.h"

#include "App/DriveView/DriveText.h"

#include <algorithm>
#include <cmath>
#include <string>

namespace velmora {

namespace {

/// The ends of the bar: every level that a phone reports is between them.
constexpr double weakest_dBm = -130;
constexpr double strongest_dBm = -40;

std::string wholeNumber(const std::optional<double>& number) {
    return number ? std::to_string(std::llround(*number)) : std::string("\u2013");
}

GridCell missing() {
    return {std::string(notReported), {}, Color::secondary, {}};
}

GridCell levelCell(const Neighbour& cell, const std::optional<LevelClass>& levelClass, bool isPast) {
    if (!cell.level_dBm)
        return missing();
    const std::string text = numberText(*cell.level_dBm);
    const double part = (*cell.level_dBm - weakest_dBm) / (strongest_dBm - weakest_dBm);
    const std::string word = levelClass ? ", " + std::string(nameOf(*levelClass)) : std::string();
    return {text, std::clamp(part, 0.0, 1.0), isPast ? Color::secondary : colorOf(levelClass),
            text + " dBm" + word};
}

GridCell differenceCell(const Neighbour& cell, const DriveNow& now) {
    if (!cell.level_dBm || !now.level || (cell.technology && cell.technology != now.technology))
        return {"\u2013", {}, Color::secondary, "unknown difference"};
    const double difference = *cell.level_dBm - now.level->number;
    const std::string text = (difference > 0 ? "+" : "") + numberText(difference);
    return {text, {}, Color::automatic, text + " dB"};
}

} // namespace

std::vector<GridColumn> neighbourColumns(std::optional<RadioTechnology> technology) {
    const std::string channel(technology ? channelNameOf(*technology) : "Channel");
    const std::string cell(technology ? physicalCellNameOf(*technology) : "Cell");
    return {{channel, "37999", TextAlignment::right},
            {cell, "504, detected"},
            {"Level, dBm", "\u2212107.75", TextAlignment::right},
            {"Quality, dB", "\u2212107.75", TextAlignment::right},
            {"\u0394 dB", "\u221212.75", TextAlignment::right}};
}

std::vector<GridRow> neighbourRows(std::span<const Neighbour> neighbours, const DriveNow& now,
                                   const LevelClasses& classes, Time time) {
    std::vector<GridRow> rows;
    for (const Neighbour& each : neighbours) {
        const bool isPast = isOld(each.time, time);
        const auto technology = each.technology ? each.technology : now.technology;
        const auto levelClass =
            each.level_dBm ? classes.of(technology, Role::NeighbourLevel, *each.level_dBm) : std::nullopt;
        const std::string detected = each.isDetected ? ", detected" : "";
        const std::string age = isPast ? ", " + ageText(each.time, time) : std::string();
        const std::string cell = wholeNumber(each.physicalCell);
        GridRow row{{wholeNumber(each.channel), {}, isPast ? Color::secondary : Color::automatic, {}},
                    {cell + detected,
                     {},
                     isPast ? Color::secondary : Color::automatic,
                     cell + (each.isDetected ? ", detected cell" : "") + age},
                    levelCell(each, levelClass, isPast),
                    each.quality_dB ? GridCell{numberText(*each.quality_dB),
                                               {},
                                               isPast ? Color::secondary : Color::automatic,
                                               numberText(*each.quality_dB) + " dB"}
                                    : missing(),
                    differenceCell(each, now)};
        rows.push_back(std::move(row));
    }
    return rows;
}

} // namespace velmora

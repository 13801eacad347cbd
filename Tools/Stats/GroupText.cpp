// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Stats/GroupText.h"

#include "Analysis/Statistics/ServingCells.h"
#include "Platform/DateText.h"
#include "Tools/Report.h"

#include <chrono>
#include <cstdio>

namespace velmora {

std::string_view groupColumn(StatisticsPlan::By by) {
    using By = StatisticsPlan::By;
    switch (by) {
    case By::File: return "file";
    case By::Cell: return "cell";
    case By::Minute: return "minute";
    case By::Square: return "square";
    case By::Nothing:
    case By::Technology: break;
    }
    return {};
}

std::string groupCell(const GroupStatistics& group, const StatsOptions& options) {
    const GroupKey& key = group.key;
    if (key.input)
        return options.files[*key.input];
    if (key.minute)
        return minuteStamp(*key.minute);
    const bool isSquare = options.by == StatisticsPlan::By::Square;
    if (key.cell == ServingCells::further)
        return isSquare ? "further squares" : "further cells";
    if (isSquare && group.cell.empty())
        return "no position";
    return group.cell.empty() ? "serving cell unknown" : group.cell;
}

std::string groupTitle(const GroupStatistics& group, const StatsOptions& options) {
    const GroupKey& key = group.key;
    using By = StatisticsPlan::By;
    if (options.by == By::Nothing)
        return {};
    if (options.by == By::Technology)
        return key.technology;
    if (options.by == By::File)
        return fileTitle(groupCell(group, options));
    return (key.minute ? minuteText(*key.minute) : groupCell(group, options)) + " (" + key.technology + ")";
}

std::string minuteStamp(Time minute) {
    return isoText(std::chrono::floor<std::chrono::seconds>(minute));
}

std::string minuteText(Time minute) {
    const auto seconds = std::chrono::floor<std::chrono::seconds>(minute);
    std::string text = dateAndTimeText(seconds, " ");
    return text.substr(0, text.rfind(':')) + " UTC";
}

std::string momentText(Time moment) {
    const auto seconds = std::chrono::floor<std::chrono::seconds>(moment);
    const auto milliseconds = std::chrono::floor<std::chrono::milliseconds>(moment - seconds);
    char fraction[8];
    std::snprintf(fraction, sizeof fraction, ".%03d", static_cast<int>(milliseconds.count()));
    return dateAndTimeText(seconds, " ") + fraction + " UTC";
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Statistics/GroupStatistics.h"
#include "Tools/Stats/StatsOptions.h"

#include <string>
#include <string_view>

namespace velmora {

/// What distinguishes groups, as a column's title: "cell"; empty where there is one group, and where the
/// technology distinguishes them.
[[nodiscard]] std::string_view groupColumn(StatisticsPlan::By by);
/// The group in that column.
[[nodiscard]] std::string groupCell(const GroupStatistics& group, const StatsOptions& options);
/// The group's heading: "drive.pcapng", "PCI 62 on EARFCN 6300 (Ostrel_LTE)"; empty for the only one.
[[nodiscard]] std::string groupTitle(const GroupStatistics& group, const StatsOptions& options);

/// The begin of a minute, for programs: "2026-11-16T05:03:00Z".
[[nodiscard]] std::string minuteStamp(Time minute);
/// The same for people: "2026-11-16 05:03 UTC".
[[nodiscard]] std::string minuteText(Time minute);
/// To the millisecond: "2026-11-16 05:00:00.250 UTC".
[[nodiscard]] std::string momentText(Time moment);

} // namespace velmora

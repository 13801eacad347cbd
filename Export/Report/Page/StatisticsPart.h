// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

namespace velmora {

class DriveReport;
class Markup;

/// Statistics of roles and fields; of two inputs side by side, with their difference.
void writeStatistics(Markup& out, const DriveReport& report);

} // namespace velmora

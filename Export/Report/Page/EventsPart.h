// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

namespace velmora {

class DriveReport;
class Markup;

/// Events: how many of each kind, and a table of those that matter most. The list beside the charts has all
/// of them instead.
void writeEvents(Markup& out, const DriveReport& report);

} // namespace velmora

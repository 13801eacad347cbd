// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

namespace velmora {

class DriveReport;
class Markup;
class TimeAxis;

/// What the page's script draws from, as JSON. Documentation/report.md describes it.
void writeData(Markup& out, const DriveReport& report, const TimeAxis& axis);

} // namespace velmora

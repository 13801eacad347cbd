// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

namespace velmora {

class DriveReport;
class Markup;

/// The first screen: what was recorded, whether it was good, and what the recording lacks.
void writeSummary(Markup& out, const DriveReport& report);

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

namespace velmora {

class DriveReport;
class Markup;

/// Serving cells, neighbours, packet-data contexts and notes.
void writeTables(Markup& out, const DriveReport& report);

} // namespace velmora

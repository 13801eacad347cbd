// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

namespace velmora {

class DriveReport;
class Markup;
class TimeAxis;

/// The charts as pictures, which the page shows on paper and where scripts are off.
void writePictures(Markup& out, const DriveReport& report, const TimeAxis& axis);

} // namespace velmora

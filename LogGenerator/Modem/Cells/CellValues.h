// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Modem/Cells/CellTable.h"

/// What the rows of a cell show, see CellRow. Each names its field, or nothing where there is no such value.
namespace velmora::LiveModem {

/// A whole number in the row's range, or any number.
void showInteger(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);
void showReal(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);
/// kHz in MHz.
void showMegahertz(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);

void showTechnology(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);
/// Only of a cell that is known by its identity alone.
void showPlace(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);
void showNetwork(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);
void showCountryCode(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);
void showNetworkCode(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);

void showCellIdentity(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);
/// The upper 12 bits of the 28, and the lower 16 (3GPP TS 25.331 10.3.2.2); nothing of an identity of 16
/// bits, which some modems report instead.
void showRNC(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);
void showCellOfRNC(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);
/// The upper 20 bits of the 28, and the lower 8 (3GPP TS 36.413 9.2.1.38).
void showENB(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);
void showSector(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);
/// A gNB's identity has 22 to 32 of the 36 bits (3GPP TS 38.413 9.3.1.6); how many, the network decides, and
/// nothing that is broadcast tells. These are for 24, which is the most usual and which the labels say.
void showGNB(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);
void showCellOfGNB(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);

void showTrackingArea(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);
void showPhysicalCell(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);
/// "7-3": the network and base station colour codes of a BSIC.
void showColourCodes(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);

/// The bands that the channel's number can mean, "n77, n78", and others in which the same frequency has
/// another number.
void showBands(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);
void showOverlappingBands(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);
/// The channel's frequency; that of the message where there is no channel that tells it.
void showDownlink(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);
void showUplink(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);

void showTimingAdvance(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);
/// The distance that the timing advance stands for. Not of NR, where it depends on the subcarrier spacing.
void showDistance(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);

} // namespace velmora::LiveModem

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/MessageReport.h"
#include "Analysis/Picture/RadioTechnology.h"

#include <optional>
#include <string>

namespace velmora {

/// The latest value of a role and where it is from.
struct Reading {
    ObservedKind kind = ObservedKind::Absent;
    double number = 0;     ///< of a number, in the role's unit; the raw number of an enumeration; 0 or 1
    std::string text;      ///< of an enumeration and a text; the display text of a number is never kept
    Time time{};           ///< when it was reported
    Time since{};          ///< since when it has been the same
    MessageNumber message; ///< that reported it
    const CatalogueField* leaf = nullptr;
};

/// A neighbour cell of the latest report that named it.
struct Neighbour {
    std::optional<double> channel; ///< as a role's value; absent where the report has none
    std::optional<double> physicalCell;
    std::optional<double> level_dBm;
    std::optional<double> quality_dB;
    bool isDetected = false; ///< the phone found it by itself: it is in no list of the network's
    Time time{};
    MessageNumber message;
    std::optional<RadioTechnology> technology; ///< absent where the report has none
};

} // namespace velmora

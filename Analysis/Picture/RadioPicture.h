// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/MessageReport.h"
#include "LogGenerator/Fields/Role.h"
#include "LogGenerator/Observations/Catalogue.h"
#include "Platform/Clock.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// The radio technology of a serving cell.
enum class RadioTechnology : std::uint8_t { GSM, UMTS, TDSCDMA, LTE, NR, CDMA1x, EVDO };

/// "GSM", "UMTS", "TD-SCDMA", "LTE", "NR", "CDMA2000 1x", "EV-DO".
[[nodiscard]] std::string_view nameOf(RadioTechnology technology);

/// What the radio-resource layer does, as far as all technologies have it in common.
enum class RadioMode : std::uint8_t {
    Off,
    Searching, ///< no serving cell yet
    Idle,      ///< camped on a cell
    Connected, ///< the network moves the phone
};

/// "off", "searching", "idle", "connected".
[[nodiscard]] std::string_view nameOf(RadioMode mode);

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
};

/// What the messages of one technology have reported of the radio network: the latest values of the roles, by
/// the radio technology of the serving cell, and the neighbour cells. A value that the messages withdrew, or
/// that was of another serving cell, is not in it.
class RadioPicture {
public:
    /// The catalogue, which may grow, must outlive it.
    explicit RadioPicture(const Catalogue& catalogue);

    void update(const MessageReport& report);
    /// Nothing is known any more.
    void clear();

    [[nodiscard]] const Catalogue& catalogue() const { return _catalogue; }
    /// Null where it is not known. For the roles of neighbours that of the strongest one.
    [[nodiscard]] const Reading* find(Role role) const;
    /// The strongest first; those without a level last.
    [[nodiscard]] std::span<const Neighbour> neighbours() const { return _neighbours; }
    /// Absent where no message has reported it.
    [[nodiscard]] std::optional<RadioTechnology> technology() const { return _technology; }
    [[nodiscard]] std::optional<RadioMode> mode() const { return _mode; }

private:
    const Catalogue& _catalogue;
    std::vector<std::optional<Reading>> _roles; ///< by role
    std::vector<Neighbour> _neighbours;
    std::optional<RadioTechnology> _technology;
    std::optional<RadioMode> _mode;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Engine/EventEngine.h"
#include "LogGenerator/Observations/Catalogue.h"
#include "LogGenerator/Observations/Observation.h"
#include "Tests/Analysis/Events/DriveEvents.h"
#include "Tests/Support/FakeClock.h"

#include <cstdint>
#include <deque>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// A message that a test writes, value by value.
class HandMadeMessage {
public:
    HandMadeMessage(Catalogue& catalogue, double seconds) : _catalogue(catalogue), _seconds(seconds) {}

    HandMadeMessage& number(std::string_view path, double value);
    HandMadeMessage& state(std::string_view path, std::int64_t raw, std::string_view text = "");
    HandMadeMessage& text(std::string_view path, std::string_view value);
    HandMadeMessage& flag(std::string_view path, bool value);
    HandMadeMessage& absent(std::string_view path);
    /// The values that follow are in that row of the innermost list of their paths.
    HandMadeMessage& row(std::uint32_t number);
    HandMadeMessage& list(std::string_view path, std::uint32_t rows);
    HandMadeMessage& removed(std::string_view path);
    HandMadeMessage& damaged(Damage damage, std::optional<std::uint32_t> code);
    /// The arrival is that of another clock: the time of the message goes by so many seconds more.
    HandMadeMessage& arrivedAt(double seconds);

    [[nodiscard]] Time time() const;
    /// Valid for as long as this.
    [[nodiscard]] ObservedMessage observed() const;

private:
    Observation& add(std::string_view path, ObservedKind kind);

    Catalogue& _catalogue;
    double _seconds;
    std::optional<double> _arrival;
    std::vector<Observation> _observations;
    std::vector<ObservedList> _lists;
    std::vector<const CatalogueField*> _removed;
    std::deque<std::string> _texts;
    std::deque<std::vector<std::uint32_t>> _rows;
    std::optional<std::uint32_t> _row;
    Damage _damage = Damage::None;
    std::optional<std::uint32_t> _code = 0x1234;
};

/// An engine of a technology that gets messages written by hand. Times are in seconds after a start.
class HandMadeEngine {
public:
    /// `roles`: the leaves that have one.
    struct RoleOfLeaf {
        std::string_view path;
        Role role;
    };
    HandMadeEngine(std::string_view technology, std::initializer_list<RoleOfLeaf> roles);

    [[nodiscard]] HandMadeMessage at(double seconds) { return {catalogue, seconds}; }
    void send(const HandMadeMessage& message);
    [[nodiscard]] const RadioPicture& picture() const { return engine.picture(); }

    /// "12.000 handover: PCI 1 to PCI 2".
    [[nodiscard]] std::vector<std::string> lines() const { return kept.lines(FakeClock::defaultNow()); }
    /// The same of one kind, without the kind.
    [[nodiscard]] std::vector<std::string> linesOf(std::string_view kind) const;
    /// The only event of that kind.
    [[nodiscard]] const Event& only(std::string_view kind) const;

    Catalogue catalogue;
    KeptEvents kept;
    EventEngine engine;
    std::uint64_t messages = 0;
};

/// The number of a field; the event must have it.
[[nodiscard]] double numberOf(const Event& event, std::string_view field);
/// The text of a field; empty where it has none.
[[nodiscard]] std::string textOf(const Event& event, std::string_view field);

/// The leaves of an LTE drive that tests report.
inline constexpr std::string_view servingPCI = "/Serving Cell/Serving Cell Info/Physical Cell ID";
inline constexpr std::string_view servingEARFCN = "/Serving Cell/Serving Cell Info/Download Frequency";
inline constexpr std::string_view servingIdentity = "/Serving Cell/Serving Cell Info/Cell Identity";
inline constexpr std::string_view servingTAC = "/Serving Cell/Serving Cell Info/Tracking Area Code";
inline constexpr std::string_view idleEARFCN = "/Serving Cell/Serving Cell Measurements/E-ARFCN";
inline constexpr std::string_view idlePCI = "/Serving Cell/Serving Cell Measurements/Physical Cell ID";
inline constexpr std::string_view idleRSRP = "/Serving Cell/Serving Cell Measurements/Measured RSRP";
inline constexpr std::string_view neighbourEARFCN = "/Idle Mode Neighbors/Neighbor Measurements/E-ARFCN";
inline constexpr std::string_view neighbourList = "/Idle Mode Neighbors/Neighbor Cells List";
inline constexpr std::string_view neighbourPCI =
    "/Idle Mode Neighbors/Neighbor Cells List/*/Physical Cell ID";
inline constexpr std::string_view neighbourRSRP = "/Idle Mode Neighbors/Neighbor Cells List/*/Measured RSRP";
inline constexpr std::string_view connectedEARFCN =
    "/Connected Mode/Connected mode LTE Intra-frequency Measurement/E-ARFCN";
inline constexpr std::string_view connectedPCI =
    "/Connected Mode/Connected mode LTE Intra-frequency Measurement/Serving Physical Cell ID";
inline constexpr std::string_view detectedList = "/Connected Mode/Detected Cells";
inline constexpr std::string_view detectedPCI = "/Connected Mode/Detected Cells/*/Physical Cell ID";

/// An LTE engine with these leaves, and the messages that are repeated.
class LTEEngine : public HandMadeEngine {
public:
    LTEEngine();
    void serve(double seconds, int pci, int earfcn = 1300);
    void measureIdle(double seconds, int pci, double rsrp, int earfcn = 1300);
    void measureConnected(double seconds, int pci, int earfcn = 1300);
    /// PCI and RSRP of each.
    void measureNeighbours(double seconds, std::vector<std::pair<int, double>> cells, int earfcn = 1300);
};

} // namespace velmora

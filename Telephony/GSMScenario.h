#pragma once

#include "Telephony/DamagedRecords.h"
#include "Telephony/GSMPhone.h"
#include "Telephony/GSMProcedures.h"
#include "Telephony/GSMReports.h"
#include "Telephony/Scenario.h"

#include <cstddef>
#include <deque>

namespace velmora {

/// A drive through a GSM/UMTS network of test networks 001/01 and 001/02, in the Ostrel GSM technology. The
/// car goes round a ring road past twelve sites (RadioNetwork); what an engineer sees in a round of about six
/// minutes:
///
/// - Power-on: network search with the lists filling, cell selection, then location update and attach, with
/// the
///   mobility states in protocol order and the equivalent networks at the end.
/// - Idle on GSM: serving cell, six neighbours whose levels rise and fall, their BSICs, the GPRS cell
/// options;
///   reselection when a neighbour has been 6 dB better for 5 s, and a location and routing area update where
///   the area changes (4101 and 4102 in 001/01, 5201 in 001/02). Every few minutes the network changes.
/// - A packet session on GSM: one context with its address and class of service.
/// - An outgoing call on GSM with handovers, hopping list and DTX, and its handover to UMTS.
/// - UMTS idle, then a packet session there: Connecting, CELL_FACH, CELL_DCH with active set, transmit power,
///   HARQ counters of six processes (now and then dual carrier), block errors that follow the Ec/No, two
///   contexts; then CELL_FACH, CELL_PCH, URA_PCH and back to idle.
/// - Reselection to GSM, to UMTS and back, each with its area update; then detach, power-off, and again from
///   the start, at another place of the ring.
///
/// About twenty messages come a second. The extra stream tells of the SIM, the cells around and the
/// contexts, as binary and XML property lists in turn. Every ten seconds or so a message is odd (see Damage).
///
/// All comes of the seed: the same seed gives the same bytes. Records are stamped as if the drive had begun
/// on 2026-01-05 at 08:00 UTC. Main thread only.
class GSMScenario final : public Scenario {
public:
    explicit GSMScenario(std::uint64_t seed);
    // The phone's procedures point into the scenario.
    GSMScenario(const GSMScenario&) = delete;
    GSMScenario& operator=(const GSMScenario&) = delete;

    [[nodiscard]] std::string_view technology() const override;
    [[nodiscard]] ScenarioEvent next() override;

    /// When the drive begins by the records' time stamps.
    [[nodiscard]] static Time beginning();

private:
    /// Fills `_events` with what the next 0.48 s bring; that may be nothing.
    void advance();
    void followTimeline();
    void remeasure();
    void reselect();
    void addReports(std::multimap<double, GSMProcedures::Step>& due, double end);
    void addDamage();
    void send(double at, const std::optional<RecordBuilder>& record);
    /// The offset of that second; never before the last one given.
    [[nodiscard]] std::chrono::nanoseconds offsetOf(double at);

    RadioNetwork _network;
    ScenarioRandom _random;
    GSMPhone _phone;
    GSMProcedures _procedures;
    GSMReportContext _context;

    double _now = 0; ///< seconds from the start
    std::size_t _phase = 0;
    double _phaseEnd = 0;
    double _betterSince = 0; ///< since when some neighbour has been better than the serving cell
    double _nextDamage = 5;
    std::size_t _damage = 0; ///< the next kind
    std::chrono::nanoseconds _lastOffset{0};
    std::deque<ScenarioEvent> _events;
};

} // namespace velmora

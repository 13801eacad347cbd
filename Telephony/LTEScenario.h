#pragma once

#include "Telephony/DamagedRecords.h"
#include "Telephony/LTEReports.h"
#include "Telephony/Scenario.h"

#include <cstddef>
#include <deque>
#include <functional>
#include <map>

namespace velmora {

/// A drive through an LTE network of test networks 001/01 and 001/02, in the Ostrel LTE technology
/// (LTENetwork). What an engineer sees in a round of less than three minutes:
///
/// - Power-on: cells of band 3 found; the serving cell with its frequencies, bandwidth and identity; then
///   registration in connected mode and a first packet-data context.
/// - Idle: level, quality and selection parameters of the serving cell; up to six neighbours whose levels
///   rise and fall, every fourth time those of another carrier; reselection when a neighbour has been 4 dB
///   better for 2 s. Where the tracking area changes (7101 and 7102 in 001/01, 8201 in 001/02) the phone
///   connects for its update, and the SIM's location follows.
/// - A packet session: connected mode with the serving cell's filtered level, up to six measured neighbours
///   and three detected cells, and handovers; now and then a second context.
/// - A walk over all carriers, 20 MHz down to 1.4, at each of them idle and briefly connected. On the two
///   narrowest the search for other frequencies has no threshold ("Not Present"); in 001/02 the power has no
///   limit. Then power-off, and again from the start, at another place of the ring.
///
/// In idle mode reselection candidates come one by one: of LTE, UTRAN, GERAN, CDMA 1x, CDMA HRPD and of an
/// unknown technology. Every seventh time three come at once; then each but the last shows as its own channel
/// and cell the priority and type of the one after it, since that is where the record has them.
///
/// From six to eight messages come a second. The extra stream tells of the SIM, the cells around and the
/// contexts, as binary and XML property lists in turn. Every ten seconds or so a message is odd (see Damage):
/// the records of serving cell, idle and connected measurement, neighbours and candidates come too short by
/// turns, and each of the three counted ones with a count too high.
///
/// All comes of the seed: the same seed gives the same bytes. Records are stamped as if the drive had begun
/// on 2026-01-05 at 08:00 UTC. Main thread only.
class LTEScenario final : public Scenario {
public:
    explicit LTEScenario(std::uint64_t seed);
    // The reports point into the scenario.
    LTEScenario(const LTEScenario&) = delete;
    LTEScenario& operator=(const LTEScenario&) = delete;

    [[nodiscard]] std::string_view technology() const override;
    [[nodiscard]] ScenarioEvent next() override;

    /// When the drive begins by the records' time stamps.
    [[nodiscard]] static Time beginning();

private:
    /// Changes the phone and gives the record that tells of it, or nothing where there is none to send.
    using Step = std::function<std::optional<RecordBuilder>()>;
    struct Phase;
    static const Phase phases[];

    /// What the phone goes through; each puts its steps on the script, from `_now` on.
    void powerOn();
    void registerWithNetwork();
    void startSession();
    void endSession();
    /// Reselects to the best cell of the next carrier.
    void changeCarrier();
    void connectBriefly();
    /// Tells the network of the tracking area, where it knows another.
    void updateArea();
    void powerOff();

    /// Fills `_events` with what the next 0.48 s bring; that may be nothing.
    void advance();
    void followTimeline();
    void remeasure();
    void reselect();
    void addReports(std::multimap<double, Step>& due, double end);
    void addDamage();
    [[nodiscard]] DamageMaterial damageMaterial();

    /// Camps on the best cell of the phone's carrier, where there is one, and tells of it.
    std::optional<RecordBuilder> camp();
    /// A step so many seconds from now.
    void say(double delay, Step step) { _script.emplace(_now + delay, std::move(step)); }
    void sayConnected(double delay, bool connected);
    void sayContexts(double delay, int count);
    void send(double at, const std::optional<RecordBuilder>& record);
    /// The offset of that second; never before the last one given.
    [[nodiscard]] std::chrono::nanoseconds offsetOf(double at);

    LTENetwork _network;
    ScenarioRandom _random;
    LTEPhone _phone;
    LTEReportContext _context;
    std::multimap<double, Step> _script;

    double _now = 0; ///< seconds from the start
    std::size_t _phase = 0;
    double _phaseEnd = 0;
    double _betterSince = 0; ///< since when some neighbour has been better than the serving cell
    double _nextDamage = 5;
    std::size_t _damage = 0; ///< how many messages have been odd
    std::chrono::nanoseconds _lastOffset{0};
    std::deque<ScenarioEvent> _events;
};

} // namespace velmora

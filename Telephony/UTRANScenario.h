#pragma once

#include "Telephony/DamagedRecords.h"
#include "Telephony/Scenario.h"
#include "Telephony/UTRANReports.h"

#include <cstddef>
#include <deque>
#include <functional>
#include <map>

namespace velmora {

/// A drive through a TD-SCDMA network of test networks 001/01 and 001/02, in the Ostrel UTRAN2 technology
/// (UTRANNetwork). What an engineer sees in a round of less than four minutes:
///
/// - Power-on: cells found, all of the detected set; then a serving cell that allows emergency calls only.
/// - Registration: Connecting, Cell DCH and back to Disconnected; from then on the cell allows all calls.
/// - Idle: the serving cell as ASET, up to five neighbours as MSET, further ones as DSET, those of the other
///   network without a status; their levels rise and fall. Reselection when a neighbour has been 5 dB better
///   for 3 s, and a registration anew where the area changes. Six GSM neighbours are measured all along,
///   which the decoder does not show.
/// - A packet session: Connecting, Cell Fach, Cell DCH with one context, the block errors of two transport
///   channels and the signal-to-interference ratios of two composite ones with one and four time slots; its
///   end goes over Cell Fach, Cell PCH and Cell URA PCH to Disconnected, and the quality lists empty.
/// - A call: Cell DCH with four transport channels on one composite one, and handovers.
/// - A packet session with two contexts; then power-off with every list empty, and again from the start.
///
/// About ten messages come a second. The extra stream tells of the SIM, the cells around and the contexts, as
/// binary and XML property lists in turn. Every ten seconds or so a message is odd (see Damage): the records
/// of the RRC state and of the serving cell come too short by turns - after the former the state is unknown
/// until the next report - and each of the three counted records comes with a count too high.
///
/// All comes of the seed: the same seed gives the same bytes. Records are stamped as if the drive had begun
/// on 2026-01-05 at 08:00 UTC. Main thread only.
class UTRANScenario final : public Scenario {
public:
    explicit UTRANScenario(std::uint64_t seed);
    // The reports point into the scenario.
    UTRANScenario(const UTRANScenario&) = delete;
    UTRANScenario& operator=(const UTRANScenario&) = delete;

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
    void startCall();
    void endCall();
    void powerOff();

    /// Fills `_events` with what the next 0.48 s bring; that may be nothing.
    void advance();
    void followTimeline();
    void remeasure();
    void reselect();
    void addReports(std::multimap<double, Step>& due, double end);
    void addDamage();
    [[nodiscard]] DamageMaterial damageMaterial();

    /// A step so many seconds from now.
    void say(double delay, Step step) { _script.emplace(_now + delay, std::move(step)); }
    void sayRRC(double delay, records::RRCState state);
    void sayContexts(double delay, int count);
    void send(double at, const std::optional<RecordBuilder>& record);
    /// The offset of that second; never before the last one given.
    [[nodiscard]] std::chrono::nanoseconds offsetOf(double at);

    UTRANNetwork _network;
    ScenarioRandom _random;
    UTRANPhone _phone;
    UTRANReportContext _context;
    std::multimap<double, Step> _script;

    double _now = 0; ///< seconds from the start
    std::size_t _phase = 0;
    double _phaseEnd = 0;
    int _sessions = 0;       ///< packet sessions so far
    double _betterSince = 0; ///< since when some neighbour has been better than the serving cell
    double _nextDamage = 5;
    std::size_t _damage = 0; ///< how many messages have been odd
    std::chrono::nanoseconds _lastOffset{0};
    std::deque<ScenarioEvent> _events;
};

} // namespace velmora

#pragma once

#include "Telephony/C2KReports.h"
#include "Telephony/Scenario.h"

#include <cstddef>
#include <deque>
#include <functional>
#include <map>

namespace velmora {

/// A drive through a CDMA2000 network with 1x and EV-DO carriers, in the Ostrel CDMA technology (C2KNetwork).
/// What an engineer sees in a round of about four minutes:
///
/// - Power-on: Powerup, Initial, Acquisition and Sync, with no system found; then Paging, with the system's
/// and the
///   base station's identities. EV-DO follows with Acquisition, Sync and the session's negotiation up to
///   Open, with a new UATI.
/// - Idle on both: 1x sleeps between pages, one pilot each, the second receive chain and the transmitters
/// "N/A", two
///   kbit/s of EV-DO control channel. The serving pilot changes when another has been 3 dB better for 2 s;
///   system, network, zone and base station change with it, and so do band and channels where the phone
///   roams.
/// - An EV-DO connection: Access, then Connected with up to three pilots, both chains and the transmitter,
/// and the
///   data rates that the C/I allows; then Idle.
/// - A 1x call: no sleep while the phone accesses the network, then Traffic with up to three pilots, both
/// chains
///   and a frame error rate that follows the pilots' Ec/Io; after it the last average marked as old. EV-DO is
///   Inactive meanwhile, as the one transmitter is the call's, and comes back after it.
/// - A second EV-DO connection, then power-off, and again from the start, at another place of the ring.
///
/// About ten messages come a second, twenty in a call. Every ten seconds or so a message is odd (see Damage):
/// records of all kinds that come too short, a system identification that lacks the base station, counts that
/// are too high, sub-packets that are missing or too large.
///
/// All comes of the seed: the same seed gives the same bytes. Records are stamped as if the drive had begun
/// on 2026-01-05 at 08:00 UTC. There is no extra stream. Main thread only.
class C2KScenario final : public Scenario {
public:
    explicit C2KScenario(std::uint64_t seed);
    // The reports point into the scenario.
    C2KScenario(const C2KScenario&) = delete;
    C2KScenario& operator=(const C2KScenario&) = delete;

    [[nodiscard]] std::string_view technology() const override;
    [[nodiscard]] ScenarioEvent next() override;

    /// When the drive begins by the records' time stamps.
    [[nodiscard]] static Time beginning();

private:
    /// Changes the phone and gives the record that tells of it.
    using Step = std::function<std::optional<RecordBuilder>()>;
    struct Phase;
    static const Phase phases[];

    /// What the phone goes through; each puts its steps on the script, from `_now` on.
    void powerOn();
    void connect();
    void disconnect();
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

    /// A step so many seconds from now.
    void say(double delay, Step step) { _script.emplace(_now + delay, std::move(step)); }
    void say1x(double delay, records::OneXState state);
    void sayEVDO(double delay, records::EVDOState state);
    void saySession(double delay, records::EVDOSession session);
    /// Acquires the EV-DO carrier again, with the session that there is.
    void sayEVDOReturn(double delay);
    void send(double at, const std::optional<RecordBuilder>& record);
    /// The offset of that second; never before the last one given.
    [[nodiscard]] std::chrono::nanoseconds offsetOf(double at);

    C2KNetwork _network;
    ScenarioRandom _random;
    C2KPhone _phone;
    C2KReportContext _context;
    std::multimap<double, Step> _script;

    double _now = 0; ///< seconds from the start
    std::size_t _phase = 0;
    double _phaseEnd = 0;
    double _betterSince = 0; ///< since when some pilot has been better than the serving one
    double _nextDamage = 5;
    std::size_t _damage = 0; ///< how many messages have been odd
    std::chrono::nanoseconds _lastOffset{0};
    std::deque<ScenarioEvent> _events;
};

} // namespace velmora

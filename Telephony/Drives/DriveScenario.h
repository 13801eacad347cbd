// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/DamagedRecords.h"
#include "Telephony/Drives/DriveScript.h"
#include "Telephony/Drives/PeriodicReport.h"
#include "Telephony/Drives/Scenario.h"
#include "Telephony/Drives/ScenarioRandom.h"

#include <cmath>
#include <cstddef>
#include <cstdint>
#include <deque>
#include <span>

namespace velmora {

/// What the drives have in common whose messages are log records: the car goes on in steps of a measurement
/// period; a round of phases, each with its procedure, is gone through again and again; procedures put steps
/// on a script; the modem's reports come by their periods in between; and every ten seconds or so a message
/// is odd (see Damage). A technology gives its network, its phone, its phases, reports and records.
///
/// All comes of the seed: the same seed gives the same bytes. Records are stamped as if the drive had begun
/// on 2026-01-05 at 08:00 UTC. Main thread only.
class DriveScenario : public Scenario {
public:
    // Steps and reports point into the scenario.
    DriveScenario(const DriveScenario&) = delete;
    DriveScenario& operator=(const DriveScenario&) = delete;

    [[nodiscard]] ScenarioEvent next() final;

    /// When the drive begins by the records' time stamps.
    [[nodiscard]] static Time beginning();

protected:
    /// A phase of the round begins with a procedure of the scenario `Kind`, where it has one, and lasts so
    /// long, or longer while the script is not at its end.
    struct Phase {
        double duration_s;
        void (DriveScenario::*begin)() = nullptr;

        template <class Kind>
        constexpr Phase(double duration, void (Kind::*procedure)())
            : duration_s(duration), begin(static_cast<void (DriveScenario::*)()>(procedure)) {}
        constexpr Phase(double duration, std::nullptr_t) : duration_s(duration) {}
    };

    /// The phases must outlive the scenario and be those of its own kind.
    DriveScenario(std::uint64_t seed, std::span<const Phase> phases) : _phases(phases), _random(seed) {}

    /// The car has gone on for so long: the network's levels change, and with them what the phone measures.
    virtual void drive(double seconds) = 0;
    /// What the phone does of its own accord after a measurement: reselection, area updates.
    virtual void react() = 0;
    /// Calls `schedule` for the reports of the phone's state.
    virtual void addReports(DriveScript& due) = 0;
    /// Called before each step, with its time. Not overriding it means that the technology counts nothing
    /// from record to record.
    virtual void countUntil(double at);
    /// What is spoilt for the odd message of that number, from 0 on: its kind is everyDamage's element
    /// `number` modulo their count.
    [[nodiscard]] virtual DamageMaterial damageMaterial(std::size_t number) = 0;

    /// Seconds from the start.
    [[nodiscard]] double now() const { return _now; }
    [[nodiscard]] ScenarioRandom& random() { return _random; }
    /// What is still to come of the procedures.
    [[nodiscard]] DriveScript& script() { return _script; }
    /// A step so many seconds from now.
    void say(double delay, DriveStep step) { _script.emplace(_now + delay, std::move(step)); }
    /// To be told after each measurement whether another cell is better: whether one has been for so long,
    /// so that it is time to go there. The time counts anew from then on.
    [[nodiscard]] bool timeToReselect(bool better, double after_s);
    /// Adds what comes of the reports before the end of this step. Each is shifted by so much more than the
    /// one before it, which keeps reports of one period apart.
    template <class Context>
    void schedule(std::span<const PeriodicReport<Context>> reports, Context& context, double spacing_s,
                  DriveScript& due) const;

private:
    /// A measurement period of the modem.
    static constexpr double step_s = 0.48;

    /// Fills `_events` with what the next step brings; that may be nothing.
    void advance();
    void followTimeline();
    void addDamage();
    void send(double at, const std::optional<RecordBuilder>& record);
    /// The offset of that second; never before the last one given.
    [[nodiscard]] std::chrono::nanoseconds offsetOf(double at);

    std::span<const Phase> _phases;
    ScenarioRandom _random;
    DriveScript _script;
    double _now = 0;
    std::size_t _phase = 0;
    double _phaseEnd = 0;
    double _betterSince = 0; ///< since when some cell has been better than the serving one
    double _nextDamage = 5;
    std::size_t _damage = 0; ///< how many messages have been odd
    std::chrono::nanoseconds _lastOffset{0};
    std::deque<ScenarioEvent> _events;
};

template <class Context>
void DriveScenario::schedule(std::span<const PeriodicReport<Context>> reports, Context& context,
                             double spacing_s, DriveScript& due) const {
    const double end = _now + step_s;
    double phase = 0;
    for (const PeriodicReport<Context>& report : reports) {
        phase += spacing_s;
        double turn = std::ceil((_now - phase) / report.period_s);
        for (; turn * report.period_s + phase < end; ++turn)
            due.emplace(turn * report.period_s + phase, [&report, &context] { return report.make(context); });
    }
}

} // namespace velmora

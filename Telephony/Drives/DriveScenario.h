// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/DriveScript.h"
#include "Telephony/Drives/PeriodicReport.h"
#include "Telephony/Drives/RadioNetwork.h"
#include "Telephony/Drives/Scenario.h"
#include "Telephony/Drives/ScenarioRandom.h"
#include "Telephony/Drives/Truth/DriveTruth.h"
#include "Telephony/Drives/UnusualMessages.h"

#include <cmath>
#include <cstddef>
#include <cstdint>
#include <deque>
#include <memory>
#include <span>

namespace velmora {

/// Common base of the drives whose messages are log records: the car moves in steps of a measurement period;
/// a round of phases, each with its procedure, repeats; procedures add steps to a script; the modem's reports
/// are sent periodically; and about every ten seconds a message is unusual (see UnusualMessage). A technology
/// provides its network, its phone, its phases, reports and records.
///
/// Everything depends only on the seed: the same seed results in the same bytes. Records are stamped as if
/// the drive had begun on 2026-01-05 at 08:00 UTC. Main thread only.
class DriveScenario : public Scenario {
public:
    // Steps and reports point into the scenario.
    DriveScenario(const DriveScenario&) = delete;
    DriveScenario& operator=(const DriveScenario&) = delete;

    [[nodiscard]] ScenarioEvent next() final;
    [[nodiscard]] RoadPlace place() const final;
    void tellTruth(TruthSink& sink) final { _truth = makeTruth(sink); }
    void finishTruth() final;

    /// When the drive begins by the records' time stamps.
    [[nodiscard]] static Time startTime();
    /// Seconds from the start to the end of the last step, whose messages `next` returns.
    [[nodiscard]] double now() const { return _now; }

protected:
    /// A phase of the round starts with a procedure of the scenario `Kind`, where it has one, and lasts
    /// `duration`, or until the script is finished if that is later.
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

    /// Replaces the phases; to be called before the first message.
    void setRound(std::span<const Phase> phases) { _phases = phases; }
    /// Moves the car: the network's levels change, and with them the phone's measurements.
    virtual void drive(double seconds) = 0;
    /// Where the car is.
    [[nodiscard]] virtual const RadioNetwork& road() const = 0;
    /// The phone's reaction to a measurement: reselection, area updates.
    virtual void react() = 0;
    /// Calls `schedule` for the reports of the phone's state.
    virtual void addReports(DriveScript& due) = 0;
    /// Called before each step, with its time. The default is for technologies without counters.
    virtual void countUntil(double at);
    /// What is changed for the unusual message of that number, from 0 on: its kind is allUnusualMessages's
    /// element `number` modulo their count.
    [[nodiscard]] virtual UnusualMessageParts unusualMessageParts(std::size_t number) = 0;

    /// What follows the technology's phone.
    [[nodiscard]] virtual std::unique_ptr<DriveTruth> makeTruth(TruthSink& sink) const = 0;

    [[nodiscard]] ScenarioRandom& random() { return _random; }
    /// The remaining steps of the procedures.
    [[nodiscard]] DriveScript& script() { return _script; }
    /// Adds a step that many seconds from now.
    void addStep(double delay, DriveStep step) { _script.emplace(_now + delay, std::move(step)); }
    /// To be called after each measurement with whether another cell is better: whether one has been for
    /// `after_s`, so that the phone reselects it. That restarts the time.
    [[nodiscard]] bool timeToReselect(bool better, double after_s);
    /// Adds the reports until the end of this step. Each is shifted by `spacing_s` more than the previous
    /// one, which keeps reports of the same period apart.
    template <class Context>
    void schedule(std::span<const PeriodicReport<Context>> reports, Context& context, double spacing_s,
                  DriveScript& due) const;

private:
    /// A measurement period of the modem.
    static constexpr double step_s = 0.48;

    /// Adds the next step's messages to `_events`; there may be none.
    void advance();
    void followTimeline();
    void addUnusualMessage();
    void send(double at, const std::optional<RecordBuilder>& record);
    /// The offset of that second; never before the last one returned.
    [[nodiscard]] std::chrono::nanoseconds offsetOf(double at);

    std::span<const Phase> _phases;
    ScenarioRandom _random;
    DriveScript _script;
    double _now = 0;
    double _stepStart = 0; ///< of the last step
    std::size_t _phase = 0;
    double _phaseEnd = 0;
    double _betterSince = 0; ///< since when some cell has been better than the serving one
    double _nextUnusual = 5;
    std::size_t _unusualCount = 0; ///< number of unusual messages so far
    std::chrono::nanoseconds _lastOffset{0};
    std::deque<ScenarioEvent> _events;
    std::unique_ptr<DriveTruth> _truth; ///< null where none wants it
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

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Classes/LevelClasses.h"
#include "Analysis/Drive/DriveEvents.h"
#include "Analysis/Drive/DriveNow.h"
#include "Analysis/Drive/DriveSamples.h"
#include "Analysis/Drive/PinnedRow.h"
#include "Analysis/Engine/EventEngine.h"
#include "Analysis/Rules/RuleSet.h"
#include "LogGenerator/LogGenerator.h"

#include <deque>
#include <functional>
#include <memory>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace velmora {

/// What the drive view shows, made of the messages of a decoder as they are decoded: live, or of a recording
/// that is played. Times are those of the messages, by the decoder's clock. Main thread only.
class DriveModel final : public ObservationSink {
public:
    using RuleFiles = std::function<std::vector<RuleFile>()>;

    /// `samples` gets the numbers over time and must outlive it. `rules` is called for each decoder; `clock`
    /// is for the catalogues that rules are checked against. Of more than `mostEvents` the oldest go.
    DriveModel(DriveSamples& samples, const Clock& clock, RuleFiles rules = {},
               std::size_t mostEvents = DriveEvents::most);
    DriveModel(const DriveModel&) = delete;
    DriveModel& operator=(const DriveModel&) = delete;

    /// From now on it gets the decoder's observations; null for none. The earlier decoder, which must still
    /// exist, is left alone from then on. Events, samples and pinned rows stay.
    void setDecoder(LogGenerator* decoder);
    /// The connection that messages come by was lost, or time jumps to another part of a recording: what is
    /// known of the radio is not valid any more.
    void interrupt();
    /// Forgets everything but the decoder and which rows are pinned.
    void reset();

    void observed(const ObservedMessage& message) override;
    /// What the detectors, the samples and the pinned rows use.
    [[nodiscard]] bool wants(const CatalogueField& leaf) const override;

    /// A message of that time could not be decoded.
    void undecoded(Time arrival);
    /// The recording has a comment on the latest message.
    void noted(std::string_view text);
    /// The reader of the recording found damage.
    void damaged(std::string_view reason);
    /// There are no more messages.
    void finish();

    /// What is known after the latest message; null without a decoder.
    [[nodiscard]] const RadioPicture* picture() const { return _engine ? &_engine->picture() : nullptr; }
    [[nodiscard]] DriveNow now() const { return _engine ? driveNow(_engine->picture()) : DriveNow(); }
    /// The strongest first; those without a level last.
    [[nodiscard]] std::span<const Neighbour> neighbours() const;
    /// The newest first.
    [[nodiscard]] const std::deque<Event>& events() const { return _events.events(); }
    [[nodiscard]] std::uint64_t eventsRevision() const { return _events.revision(); }
    /// How many messages there have been: as long as it is the same, so is everything else.
    [[nodiscard]] std::uint64_t messages() const { return _messages; }
    /// Of the latest message; absent before the first.
    [[nodiscard]] std::optional<Time> latest() const { return _latest; }

    /// The latest time of the messages, those that go back by a little left aside; absent before the first.
    [[nodiscard]] std::optional<Time> lastChecked() const { return _engine ? _engine->last() : std::nullopt; }

    /// How good levels and qualities are, by the rules.
    [[nodiscard]] const LevelClasses& classes() const { return _classes; }

    /// Those that every drive has, then those of the pinned rows.
    [[nodiscard]] std::vector<DriveSeries> series() const;
    /// Pins the row at this path of the display ("/GSM/Neighboring Cells/0/RSSI"), or takes it off. False
    /// where it has no numbers.
    bool togglePin(const std::string& path);
    /// Whether the row has numbers.
    [[nodiscard]] bool canPin(const std::string& path) const;
    [[nodiscard]] bool isPinned(const std::string& path) const;

    static constexpr std::size_t mostPinned = 8;

private:
    void report(const MessageReport& report);
    void sampleNeighbours(const MessageReport& report);
    void samplePinned(const MessageReport& report);
    void addRules();

    DriveSamples& _samples;
    const Clock& _clock;
    RuleFiles _rules;
    LogGenerator* _decoder = nullptr;
    DriveEvents _events;
    std::unique_ptr<EventEngine> _engine; ///< refers to the decoder's catalogue
    LevelClasses _classes;
    std::vector<PinnedRow> _pinned;
    std::uint64_t _messages = 0;
    std::optional<Time> _latest;
    std::optional<RadioTechnology> _technology; ///< as `_samples` has it
    std::optional<RadioMode> _mode;
};

} // namespace velmora

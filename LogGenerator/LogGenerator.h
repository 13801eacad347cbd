// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Display/ChangingPlace.h"
#include "Platform/Clock.h"
#include "PropertyLists/Value.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

class Catalogue;
class MessageEffects;
class ObservationSink;
class Observer;

/// A technology's log decoder, as the model uses it. Decoders keep what they decode in the state
/// dictionary that every call gets: the model owns it and it outlives them, so that a new decoder
/// continues from the earlier one's values. Main thread only.
///
/// State keys that every decoder uses: "Display" (the latest display dictionary), "DisplayState" (the raw
/// messages of the latest display), "ExtraInfo" (a dictionary of extra values), "History" (see
/// updateHistoryInState).
class LogGenerator {
public:
    /// `clock` dates the history and must outlive the decoder.
    explicit LogGenerator(const Clock& clock);
    virtual ~LogGenerator();
    LogGenerator(const LogGenerator&) = delete;
    LogGenerator& operator=(const LogGenerator&) = delete;

    /// Decodes one log message into the state. Called for every message.
    virtual void updateState(Dictionary& state, const Data& data) = 0;
    /// `updateState`, and reports what the message concerned. The default reports the entire display.
    virtual void updateStateReporting(Dictionary& state, const Data& data, MessageEffects& effects);
    /// The display for the current state, or none when there is nothing to show yet; appends a history entry.
    /// Called once per redraw with new data.
    [[nodiscard]] virtual Value generateLogUsingState(Dictionary& state) = 0;
    /// The current display, none where it has not been built; nothing else happens. A decoder may keep
    /// records until the display is requested, so that "Display" in the state may lack the latest ones: read
    /// it through this function only.
    [[nodiscard]] virtual Value display(Dictionary& state);
    /// Of the displays only what these paths lead to (see PathPattern) is needed from now on: the rest may
    /// show less than has arrived, which saves writing it. Errors of all messages are logged as before. To be
    /// called before the first message. The default writes everything.
    virtual void setWantedPaths(std::span<const std::string> /*paths*/) {}
    /// All places of the state's display that messages change. Empty where they are not known: then each
    /// message may change everything. The counts are those of records that have arrived,
    /// which `display` writes.
    [[nodiscard]] virtual std::vector<ChangingPlace> changingPlaces(const Dictionary& /*state*/) const {
        return {};
    }
    /// What the decoder needs for later messages and has not in the state; none for most. With a state after
    /// `display` and this, another decoder continues as this one would.
    [[nodiscard]] virtual Value memory() const { return {}; }
    virtual void setMemory(const Value& /*memory*/) {}
    /// The property-list dictionary that makes the telephony service stream this technology's messages.
    [[nodiscard]] virtual DictionaryRef getStartCommand() const = 0;
    /// What a snapshot saves: dictionaries that each hold a "Description" string.
    [[nodiscard]] virtual ArrayRef getSaveContentsFromState(const Dictionary& state) const = 0;

    /// Whether every refresh is kept in the history, for a snapshot; the default is yes. Without it
    /// "DisplayState" and "History" are not changed, and a refresh copies nothing.
    void setKeepsHistory(bool keeps) { _keepsHistory = keeps; }

    /// The telephony service's constant for the technology that it decodes; empty for a decoder that no
    /// technology names.
    [[nodiscard]] virtual std::string_view technology() const { return {}; }
    /// Every leaf that its displays can show. Made on the first call.
    [[nodiscard]] Catalogue& catalogue();
    /// Sets the sink, which receives the observations of each message from now on and must outlive the
    /// decoder or the next call. Null for none: then no observations are computed.
    void setObservationSink(ObservationSink* sink);
    /// When the latest record of a section arrived, since there is a sink: how old what it shows is. Absent
    /// where none has, and for what is no section.
    [[nodiscard]] virtual std::optional<Time> latestRecord(std::string_view /*section*/) const { return {}; }

    /// A new decoder for the technology that the telephony service names by one of its constants; null for
    /// any other name, and where the decoder cannot be made.
    [[nodiscard]] static std::unique_ptr<LogGenerator> generatorFromTechnology(std::string_view technology,
                                                                               const Clock& clock);

    /// Appends an entry to the state's "History", an array of at most 5, oldest first. An entry holds frozen
    /// copies of "DisplayState", "Display" and "ExtraInfo", then "Date" and "Description", in this order, and
    /// ends before the first missing one, so that it never has a gap.
    static void updateHistoryInState(Dictionary& state, const Clock& clock);

protected:
    /// Enters the leaves into the catalogue.
    virtual void describe(Catalogue& /*catalogue*/) {}
    /// Observations are made with this observer from now on, or not any more (null).
    virtual void observe(Observer* /*observer*/) {}
    /// Null where there is no sink.
    [[nodiscard]] Observer* observer() { return _sink ? _observer.get() : nullptr; }
    /// Passes what was observed of a message to the sink. Precondition: there is one.
    void passObservations(std::optional<std::uint32_t> code, std::optional<std::uint64_t> timestamp);

    [[nodiscard]] const Clock& clock() const { return _clock; }
    [[nodiscard]] bool keepsHistory() const { return _keepsHistory; }

private:
    const Clock& _clock;
    bool _keepsHistory = true;
    std::unique_ptr<Catalogue> _catalogue;
    std::unique_ptr<Observer> _observer; ///< since there was a sink
    ObservationSink* _sink = nullptr;
};

} // namespace velmora

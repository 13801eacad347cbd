// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "PropertyLists/Value.h"

#include <memory>
#include <string_view>

namespace velmora {

class MessageEffects;

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
    virtual ~LogGenerator() = default;
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
    /// The property-list dictionary that makes the telephony service stream this technology's messages.
    [[nodiscard]] virtual DictionaryRef getStartCommand() const = 0;
    /// What a snapshot saves: dictionaries that each hold a "Description" string.
    [[nodiscard]] virtual ArrayRef getSaveContentsFromState(const Dictionary& state) const = 0;

    /// Whether every refresh is kept in the history, for a snapshot; the default is yes. Without it
    /// "DisplayState" and "History" are not changed, and a refresh copies nothing.
    void setKeepsHistory(bool keeps) { _keepsHistory = keeps; }

    /// A new decoder for the technology that the telephony service names by one of its constants; null for
    /// any other name, and where the decoder cannot be made.
    [[nodiscard]] static std::unique_ptr<LogGenerator> generatorFromTechnology(std::string_view technology,
                                                                               const Clock& clock);

    /// Appends an entry to the state's "History", an array of at most 5, oldest first. An entry holds frozen
    /// copies of "DisplayState", "Display" and "ExtraInfo", then "Date" and "Description", in this order, and
    /// ends before the first missing one, so that it never has a gap.
    static void updateHistoryInState(Dictionary& state, const Clock& clock);

protected:
    [[nodiscard]] const Clock& clock() const { return _clock; }
    [[nodiscard]] bool keepsHistory() const { return _keepsHistory; }

private:
    const Clock& _clock;
    bool _keepsHistory = true;
};

} // namespace velmora

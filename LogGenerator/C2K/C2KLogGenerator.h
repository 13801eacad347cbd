// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/C2K/KeptReadings.h"
#include "LogGenerator/Display/PathRests.h"
#include "LogGenerator/Observations/FieldMap.h"
#include "LogGenerator/OstrelLogGenerator.h"
#include "LogMessages/LogMessage.h"
#include "Platform/TelephonyService.h"

namespace velmora {

/// The decoder of the technology Ostrel CDMA (CDMA2000 1x and EV-DO). It has no sections: the template
/// "C2KTemplate" defines which value is shown under which label, and eight parsers, one a log code, put their
/// values there through the lookup that is built from it. The generator holds nothing but the raw records
/// since the last display and the latest reading of each parser, until the display is handed out; all else is
/// in the state, so that a new decoder continues where an earlier one ended.
///
/// State keys beside LogGenerator's: "Template" (the template as it was loaded), "Lookup" (value key to array
/// of {"key": label, "dict": the display dictionary that holds it}), and the parsers' running values:
/// "TrafficFER", "FLDataSeqNum", "FLDataSent", "RLDataSeqNum", "RLDataSent", with copies of the latter four
/// in "ExtraInfo".
class C2KLogGenerator final : public OstrelLogGenerator {
public:
    explicit C2KLogGenerator(const Clock& clock) : OstrelLogGenerator(clock) {}
    /// Leaves all that has arrived in the display, where the next decoder finds it.
    ~C2KLogGenerator() override;
    [[nodiscard]] static std::unique_ptr<C2KLogGenerator> generator(const Clock& clock);

    [[nodiscard]] std::string_view technology() const override {
        return kVoxLogChannelTechnology_Ostrel_CDMA;
    }
    [[nodiscard]] DictionaryRef getStartCommand() const override;
    void updateState(Dictionary& state, const Data& data) override;
    /// Reports the values that the message published.
    void updateStateReporting(Dictionary& state, const Data& data, MessageEffects& effects) override;
    [[nodiscard]] Value generateLogUsingState(Dictionary& state) override;
    [[nodiscard]] Value display(Dictionary& state) override;
    void setWantedPaths(std::span<const std::string> paths) override {
        _wanted = {false, {paths.begin(), paths.end()}};
    }
    [[nodiscard]] std::vector<ChangingPlace> changingPlaces(const Dictionary& state) const override;

    /// Decodes one message and keeps its record, less prefix, for the log where its code is one of the eight,
    /// whether or not the parser accepted it. `lookup`: null where the display could not be built; then the
    /// parsers show nothing. A message below 13 bytes as it arrived is dropped without a log line. `effects`,
    /// unless null, gets the values.
    void updateFromLog(const Data& data, const DictionaryRef& lookup, Dictionary& state,
                       MessageEffects* effects = nullptr);

    /// Fills display and lookup from a template: a dictionary becomes a sub-screen, "_sorted" is copied, any
    /// other string is the value key that its label shows and an empty text until there is a value. Values of
    /// other kinds are skipped.
    static void processTemplate(const Dictionary& source, const DictionaryRef& display, Dictionary& lookup);

    /// The state's display, which the first call builds; none, with an error line, where there is no template
    /// (the next call looks it up again). What a decoder keeps is not written yet: see `display`.
    [[nodiscard]] static Value getDisplayFromState(Dictionary& state);

protected:
    void describe(Catalogue& catalogue) override;
    void observe(Observer* observer) override;

private:
    void update(Dictionary& state, const Data& data, MessageEffects* effects);
    void decode(const Data& data, const std::optional<LogMessage>& message, const DictionaryRef& lookup,
                Dictionary& state, MessageEffects* effects);

    /// Nothing is written that is not wanted of the new display.
    void limit(const Dictionary& state);

    PathRests _wanted{true, {}}; ///< of the root
    C2K::KeptReadings _readings;
    FieldMap _fieldMap; ///< of the value keys, since there is a catalogue
};

} // namespace velmora

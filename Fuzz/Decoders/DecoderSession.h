// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/LogGenerator.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeResources.h"

#include <memory>
#include <string>
#include <string_view>

namespace velmora {

/// A technology whose decoder is fuzzed.
struct FuzzedTechnology {
    std::string_view constant;     ///< the telephony service's
    std::string_view templateName; ///< that of its resource; empty where it needs none
    std::string_view scenario;     ///< the drive that its seeds are taken from
};

inline constexpr FuzzedTechnology fuzzedTechnologies[] = {
    {"kVoxLogChannelTechnology_Ostrel_GSM", "Ostrel_GSM", "gsm"},
    {"kVoxLogChannelTechnology_Ostrel_LTE", "LTE", "lte"},
    {"kVoxLogChannelTechnology_Ostrel_UTRAN2", "Ostrel_UTRAN", "utran"},
    {"kVoxLogChannelTechnology_Ostrel_CDMA", "C2KTemplate", "c2k"},
    {"kVoxLogChannelTechnology_Modem", "Modem", "modem"},
    {"kVoxLogChannelTechnology_IFX", "", "ifx"},
};
inline constexpr std::size_t binaryTechnologies = 5; ///< the first of them

/// The templates that are shipped, as the process's resources for as long as this lives.
class ShippedTemplates {
public:
    ShippedTemplates();
    /// That template, read.
    [[nodiscard]] static Value read(std::string_view templateName);

private:
    FakeResources _resources;
};

/// Makes decoders of one technology, whose template is read once. ShippedTemplates must be there.
class DecoderMaker {
public:
    explicit DecoderMaker(const FuzzedTechnology& technology);

    /// A state that knows the template, so that no decoder has to read it again.
    [[nodiscard]] DictionaryRef newState() const;
    [[nodiscard]] std::unique_ptr<LogGenerator> newDecoder() const;

private:
    std::string _technology;
    FakeClock _clock;
    Value _template; ///< none where the technology has none
};

/// Decodes one message. False where it is one of those that are meant to end the program: a SIM file that
/// cannot be read, and what a serialized-object baseband must not send.
[[nodiscard]] bool updateDecoder(LogGenerator& decoder, Dictionary& state, const Data& message);

/// A reconnection makes a decoder, which takes the time of many messages. Further ones in a script are
/// ignored.
inline constexpr int maximumReconnects = 3;

/// A decoder and its state. Both are at their beginning.
class DecoderSession {
public:
    explicit DecoderSession(const DecoderMaker& maker)
        : _maker(maker), _state(maker.newState()), _decoder(maker.newDecoder()) {}

    /// Decodes one message, see `updateDecoder`.
    [[nodiscard]] bool update(const Data& message) { return updateDecoder(*_decoder, *_state, message); }
    void redraw();
    /// Another decoder continues with the same state.
    void reconnect() { _decoder = _maker.newDecoder(); }

    [[nodiscard]] Dictionary& state() { return *_state; }
    /// The current one; none before the first has been built.
    [[nodiscard]] Value display() { return _decoder->display(*_state); }
    [[nodiscard]] const LogGenerator& decoder() const { return *_decoder; }

private:
    const DecoderMaker& _maker;
    DictionaryRef _state;
    std::unique_ptr<LogGenerator> _decoder;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/Decoders/FuzzedDecoders.h"
#include "Fuzz/Decoders/MessageScript.h"
#include "Fuzz/FuzzTargets.h"
#include "Tests/LogGenerator/Observations/DisplayCheck.h"

#include <optional>

namespace velmora {

namespace {

/// The input's first byte chooses the technology, the rest is a MessageScript. Each message's observations
/// are to be what the message shows.
class ObservationsTarget final : public FuzzTarget {
public:
    void run(Bytes input) override {
        if (input.empty())
            return;
        const DecoderMaker& maker = _decoders.of(input.front());
        const DictionaryRef state = maker.newState();
        std::unique_ptr<LogGenerator> decoder = maker.newDecoder();
        static_cast<void>(decoder->generateLogUsingState(*state)); // builds the display
        std::optional<DisplayCheck> check(*decoder);
        MessageScript script(input.subspan(1));
        bool reconnected = false;
        while (const auto step = script.next()) {
            if (step->kind == MessageScript::Kind::Message) {
                if (!expectObserved(*decoder, *check, *state, step->message))
                    return;
            } else if (step->kind == MessageScript::Kind::Reconnect && !reconnected) {
                reconnected = true; // once: a catalogue takes as long as many messages
                check.reset();
                decoder = maker.newDecoder();
                check.emplace(*decoder);
                static_cast<void>(decoder->generateLogUsingState(*state));
            }
        }
    }

private:
    /// False where the message is meant to end the program.
    static bool expectObserved(LogGenerator& decoder, DisplayCheck& check, Dictionary& state,
                               const Data& message) {
        check.mark(state);
        if (!updateDecoder(decoder, state, message))
            return false;
        if (const std::vector<std::string> problems = check.problems(state); !problems.empty())
            throw BrokenInvariant(problems.front());
        return true;
    }

    FuzzedDecoders _decoders;
};

} // namespace

std::unique_ptr<FuzzTarget> makeObservationsTarget() {
    return std::make_unique<ObservationsTarget>();
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/CorpusTools.h"
#include "Fuzz/Decoders/DecoderSession.h"
#include "Fuzz/Decoders/MessageScript.h"
#include "Fuzz/DriveMessages.h"
#include "Fuzz/FuzzCorpora.h"
#include "Tests/Support/Hex.h"

#include <set>

namespace velmora {

namespace {

using Script = std::vector<std::uint8_t>;

constexpr std::chrono::minutes drive{3};

void append(Script& script, const MessageScript::Step& step) {
    const Script bytes = MessageScript::encode(step);
    script.insert(script.end(), bytes.begin(), bytes.end());
}

void append(Script& script, const Data& message) {
    append(script, {MessageScript::Kind::Message, message});
}

/// Three messages with redraws and a reconnection in between.
Script threeSteps(const Data& first, const Data& second, const Data& third) {
    Script script;
    append(script, first);
    append(script, {MessageScript::Kind::Redraw, {}});
    append(script, second);
    append(script, {MessageScript::Kind::Reconnect, {}});
    append(script, third);
    append(script, {MessageScript::Kind::Redraw, {}});
    return script;
}

/// How a script's records begin: kind and log code.
void addRecordTokens(const std::vector<Data>& scripts, std::vector<Data>& tokens) {
    constexpr std::size_t beginning = 3;
    std::set<Script> known;
    for (const Data& script : scripts)
        if (script.size() >= beginning) {
            const Bytes bytes = script.bytes().first(beginning);
            if (Script token(bytes.begin(), bytes.end()); known.insert(token).second)
                tokens.emplace_back(std::move(token));
        }
}

} // namespace

FuzzCorpus decoderCorpus(std::string_view scenario) {
    FuzzCorpus corpus;
    const std::vector<Data> messages = driveMessages(scenario, drive, 2);
    for (const Data& message : messages) {
        Script script;
        append(script, message);
        corpus.seeds.emplace_back(std::move(script));
    }
    addRecordTokens(corpus.seeds, corpus.tokens);
    for (std::size_t i = 0; i < messages.size(); ++i)
        corpus.seeds.emplace_back(threeSteps(messages[i], messages[(i + 1) % messages.size()],
                                             messages[(i + 2) % messages.size()]));
    for (const Data& token : propertyListTokens())
        corpus.tokens.push_back(token);
    return corpus;
}

FuzzCorpus sameLabelsCorpus() {
    FuzzCorpus corpus;
    for (std::size_t i = 0; i < std::size(fuzzedTechnologies); ++i) {
        // A turn and then the first of its messages once more, so that this is known on one side alone.
        const FuzzCorpus decoder = decoderCorpus(fuzzedTechnologies[i].scenario);
        const std::size_t messages = decoder.seeds.size() / 2;
        for (std::size_t j = 0; j < messages; ++j)
            corpus.seeds.push_back(withFirstByte(
                static_cast<std::uint8_t>(i), joined(decoder.seeds[messages + j], decoder.seeds[j]).bytes()));
        corpus.tokens.insert(corpus.tokens.end(), decoder.tokens.begin(), decoder.tokens.end());
    }
    return corpus;
}

} // namespace velmora

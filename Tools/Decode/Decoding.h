// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/MessageEffects.h"
#include "Platform/Clock.h"
#include "Platform/Result.h"
#include "PropertyLists/Value.h"
#include "Recording/MessageReader.h"
#include "Tools/Decode/UndecodedMessages.h"
#include "Tools/Messages/MessageSelection.h"

#include <cstdint>
#include <functional>
#include <string>
#include <vector>

namespace velmora {

class DecodeProgress;
class WorkContext;

/// The result of decoding one technology of a file.
struct Decoded {
    std::string technology;     ///< the short name
    std::uint64_t messages = 0; ///< dropped and undecoded ones included
    std::uint64_t refreshes = 0;
    Value display;               ///< after the latest refresh; none if there was none
    bool isOneOfSeveral = false; ///< the file holds several technologies, each of which is decoded
};

/// The result of decoding a file.
struct DecodedFile {
    std::vector<Decoded> technologies; ///< in the file's order; at least one
    UndecodedMessages undecoded;
};

/// Gets decoding's events as they happen. Displays and the state belong to the decoder: they change with the
/// next message.
class DecodingObserver {
public:
    virtual ~DecodingObserver() = default;

    /// The decoder of a technology is there; called before anything of that technology is decoded.
    virtual void didMakeDecoder(LogGenerator& /*decoder*/) {}
    /// The calls that follow, up to the next of this kind, concern this technology. Called at the first of
    /// them, where another technology follows, and again where the file turns out to hold several.
    virtual void willConcern(const Decoded& /*decoded*/) {}
    /// Called before a selected message is decoded.
    virtual void willDecode(const LoggedMessage&) {}
    /// The observer of each message's effects; called once. Null for none, which makes decoding faster.
    [[nodiscard]] virtual MessageEffects* effects() { return nullptr; }
    /// Whether the decoder keeps its history, which a snapshot saves; called at the start and after each
    /// refresh. Decoding without is faster.
    [[nodiscard]] virtual bool wantsHistory(std::uint64_t /*refreshes*/) const { return false; }
    /// Whether the display is needed at each refresh, or only at the last one; called once. Decoding without
    /// is faster, since only the requested displays are written.
    [[nodiscard]] virtual bool wantsEveryRefresh() const { return true; }
    /// A selected message has been decoded; `decoder.display(state)` is the display after it. Not called
    /// for a message that could not be decoded.
    virtual void didDecode(const LoggedMessage&, LogGenerator& /*decoder*/, Dictionary& /*state*/) {}
    /// Called after a refresh; `decoded` holds the display and the result so far.
    virtual void didRefresh(Time /*tick*/, const Decoded& /*decoded*/) {}
    /// Called after the last refresh, with the final state, whether or not that refresh is to be written.
    virtual void didFinish(const LogGenerator& /*decoder*/, const Dictionary& /*state*/) {}
    /// Whether decoding may stop here; called after every message.
    [[nodiscard]] virtual bool isDone() const { return false; }
};

struct DecodingRequest {
    /// What is done where the file holds several technologies and none is chosen.
    enum class Several {
        Decode, ///< each is decoded
        First,  ///< the first is decoded; messages of the others are losses
        Refuse, ///< decoding fails
    };

    std::string technology;             ///< overrides the file's, or chooses one; empty for the file's
    MessageSelection messages;          ///< others are skipped; what is not to be written is not observed
    DecodeProgress* progress = nullptr; ///< gets the offset of every message, selected or not; may be null
    /// A message that ends the application ends the program here as well.
    bool isStrict = false;
    /// Called for the decoder of each technology, before it decodes anything; what it raises passes through.
    std::function<void(LogGenerator&)> checkDecoder = {};
    Several several = Several::Decode;
    /// Those of the whole file, where they have been found out beforehand (technologiesOf); without, those
    /// count that the file names before its first message, and further ones as they come.
    std::vector<std::string> technologies = {};
};

/// Runs a file's messages through the decoders of their technologies, each of which has a state of its own,
/// and refreshes as the application does while they arrive, all in the file's order. `context` gets each
/// record's number. A message that ends the application by an exception (UnknownDataException,
/// AssertionFailure) changes nothing in the state, is counted and left out; where the request is strict, the
/// exception passes through, as others always do. Fails before anything is decoded when the first technology
/// has no decoder, and afterwards when a decoder had no template. Messages of a further technology without
/// decoder are counted as those that could not be decoded.
[[nodiscard]] Result<DecodedFile> decodeMessages(MessageReader& reader, const DecodingRequest& request,
                                                 WorkContext& context, DecodingObserver& observer);

/// Reports what the reader skipped of the file, and why it ended. Returns whether all of it was read.
bool reportLosses(const MessageReader& reader, const std::string& title);

} // namespace velmora

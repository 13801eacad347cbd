// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Observation.h"
#include "Playback/PlayedDecoder.h"
#include "Tools/Browse/Data/BrowsedFile.h"

#include <cstdint>
#include <memory>
#include <string>

namespace velmora {

/// Goes through all messages of a browsed file once, in steps, beside what else the program does. It follows
/// the index and ends with it. Main thread only.
class FilePass : protected ObservationSink {
public:
    ~FilePass() override;
    FilePass(const FilePass&) = delete;
    FilePass& operator=(const FilePass&) = delete;

    /// Takes at most that many messages. False once the file has ended, or cannot be read any more.
    bool step(std::uint64_t messages);
    [[nodiscard]] std::uint64_t position() const { return _position; }
    [[nodiscard]] bool isDone() const { return _isDone; }

protected:
    enum class Decoding : bool { Without, With };
    /// The file must outlive it.
    FilePass(const BrowsedFile& file, Decoding decoding);

    /// The message has been decoded, and `observed` called for it, where it is decoded.
    virtual void took(const LoggedMessage& message) = 0;
    virtual void ended() {}
    void observed(const ObservedMessage& /*message*/) override {}

    /// Once before the first step: from here on messages are observed as `wants` says.
    void beginObserving();
    [[nodiscard]] const BrowsedFile& file() const { return _file; }
    [[nodiscard]] Catalogue& catalogue() { return _decoder->decoder().catalogue(); }

private:
    const BrowsedFile& _file;
    std::unique_ptr<MessageReader> _reader;
    std::unique_ptr<PlayedDecoder> _decoder;
    std::uint64_t _position = 0; ///< of the message that is taken next
    bool _isDone = false;
};

} // namespace velmora

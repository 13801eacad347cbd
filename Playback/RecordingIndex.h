// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Playback/IndexPass.h"
#include "Playback/PlayedDecoder.h"
#include "Playback/PlayedFile.h"

#include <cstddef>
#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace velmora {

/// What a file holds of one technology, with checkpoints between which a player begins. It is made in one
/// pass, in steps; what the pass has read can be played meanwhile. The checkpoints lie 1024 messages apart
/// and farther in longer files, so that all of them need no more memory than the limit. Main thread only.
class RecordingIndex {
public:
    struct Limits {
        std::size_t memory = std::size_t{32} << 20; ///< of the checkpoints, in bytes
        std::uint64_t spacing = 1024;               ///< of the checkpoints of a short file, in messages
    };

    struct Checkpoint {
        MessagePlace place;
        std::optional<PlayedDecoder::Checkpoint> decoder; ///< none at the drive's start
        Time latest = Time::min();                        ///< of the messages before it
        PlayedPicture::Memory picture{};                  ///< empty without a pass

        [[nodiscard]] std::uint64_t messages() const { return decoder ? decoder->messages : 0; }
        [[nodiscard]] std::uint64_t refreshes() const { return decoder ? decoder->refreshes.count() : 0; }
    };

    /// Nothing of the file has been read. `technology`: its short name; empty for the first that the file
    /// names. Fails where the technology has no decoder, or the file does not hold
    /// it. The file must outlive this.
    static Result<std::unique_ptr<RecordingIndex>> make(PlayedFile& file, const std::string& technology,
                                                        PlayedDecoder::Masking masking, Limits limits);
    static Result<std::unique_ptr<RecordingIndex>> make(PlayedFile& file, const std::string& technology,
                                                        PlayedDecoder::Masking masking) {
        return make(file, technology, std::move(masking), Limits());
    }

    /// What is made of the messages that are read from now on; null for nothing, which is the default. It
    /// must outlive this, or be taken off.
    void setPass(IndexPass* pass) { _pass = pass; }

    /// Reads at most that many messages of the file on. False once all is read.
    bool read(std::uint64_t messages);
    [[nodiscard]] bool isComplete() const { return _isComplete; }

    /// The short name of the technology.
    [[nodiscard]] const std::string& technology() const { return _technology; }
    /// Whether it is the technology of a message.
    [[nodiscard]] bool has(const LoggedMessage& message) const;
    /// Messages of the technology so far.
    [[nodiscard]] std::uint64_t messages() const { return _decoder->messages(); }
    [[nodiscard]] std::uint64_t refreshes() const { return _decoder->refreshes().count(); }
    /// When the first message arrived, and the latest; absent while there is none.
    [[nodiscard]] std::optional<Time> first() const { return _first; }
    [[nodiscard]] std::optional<Time> last() const { return _first ? std::optional(_latest) : _first; }

    /// Messages of the technology that could not be decoded, and the first of them.
    struct Undecoded {
        std::uint64_t messages = 0;
        std::uint64_t number = 0;
        std::uint64_t offset = 0;
        std::string reason;
    };
    [[nodiscard]] const Undecoded& undecoded() const { return _undecoded; }

    /// The last checkpoint with at most that many messages before it, with at most that many refreshes, or
    /// with none at or after the time.
    [[nodiscard]] const Checkpoint& beforeMessage(std::uint64_t messages) const;
    [[nodiscard]] const Checkpoint& beforeRefresh(std::uint64_t refreshes) const;
    [[nodiscard]] const Checkpoint& beforeTime(Time time) const;
    [[nodiscard]] const std::vector<Checkpoint>& checkpoints() const { return _checkpoints; }
    /// Of the checkpoints, in bytes.
    [[nodiscard]] std::size_t memory() const { return _memory; }

    /// The decoder of the pass: what it observes is the file's.
    [[nodiscard]] PlayedDecoder& decoder() { return *_decoder; }

private:
    RecordingIndex(PlayedFile& file, Limits limits)
        : _file(file), _memoryLimit(limits.memory), _spacing(limits.spacing) {}
    [[nodiscard]] Result<Done> choose(const std::string& technology);
    void take(const LoggedMessage& message);
    void reportLosses();
    void reportNotes();
    void finish();
    void addCheckpoint();
    void thinOut();

    PlayedFile& _file;
    std::size_t _memoryLimit;
    std::uint64_t _spacing;
    std::string _technology;
    bool _isOverridden = false;         ///< the messages are decoded as another technology than the file says
    mutable std::vector<bool> _isShown; ///< by the number of a technology, as far as they are known
    std::unique_ptr<PlayedDecoder> _decoder;
    std::optional<LoggedMessage> _ahead; ///< the first message, which had to be read for the technology
    std::vector<Checkpoint> _checkpoints;
    std::size_t _memory = 0;
    std::optional<Time> _first;
    Time _latest = Time::min();
    Undecoded _undecoded;
    IndexPass* _pass = nullptr;
    std::uint64_t _losses = 0;   ///< that the pass has got
    std::uint64_t _comments = 0; ///< of them those on messages
    bool _isComplete = false;
};

} // namespace velmora

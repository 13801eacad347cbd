// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Platform/Result.h"
#include "Recorder/RecordingFile.h"
#include "Recording/Pcapng/PcapngWriter.h"

#include <cstddef>
#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace velmora {

/// A recording that is being written. The file is created at once, so that an error shows at once; its head
/// is written when the technology is known. Without a technology no file is left. A file that is overwritten
/// is replaced in one step, by one that has its head.
///
/// A file that others remove, replace or write to while it is recorded to is left at the next save, and the
/// recording continues in a new file beside it, with what was buffered. Main thread only.
class RecordingSession {
public:
    /// Opens the file, "-" being standard output. A regular file that is there already is refused unless
    /// `force`; even then it keeps its content until the technology is known.
    static Result<std::unique_ptr<RecordingSession>> open(const std::string& path, bool force);

    /// The recording gets positions. Call it before the technology is known.
    void setHasPositions() { _positions = PcapngWriter::Positions::With; }

    ~RecordingSession();
    RecordingSession(const RecordingSession&) = delete;
    RecordingSession& operator=(const RecordingSession&) = delete;

    /// To be called when the service has named the technology. The first call starts the recording; another
    /// technology after that is a failure.
    Result<Done> setTechnology(std::string_view technology);
    /// A message has arrived. A failure ends the recording; a temporary error is not a failure (see
    /// `temporaryError`). Precondition: the technology is known.
    Result<Done> append(Time time, Bytes message);
    /// A sentence of the receiver has arrived; as a message. It is lost while the technology is unknown.
    /// Precondition: the recording has positions.
    Result<Done> appendSentence(Time time, std::string_view sentence);
    /// A text of the user's about this moment, which goes into the file as a comment on the next message; cut
    /// to `longestNote` bytes.
    void note(std::string text);
    /// Notes that no message has followed yet.
    [[nodiscard]] std::size_t waitingNotes() const { return _notes.size(); }
    static constexpr std::size_t longestNote = 1000;
    /// Writes the buffer to the file and starts its sync to storage; does nothing before the technology is
    /// known but to notice that others have changed the file. Retries after a temporary error. A failure is
    /// as above.
    Result<Done> save();
    /// Ends the recording. A temporary error that persists is a failure now.
    Result<Done> close();

    /// The technology's short name; empty while it is unknown.
    [[nodiscard]] const std::string& technology() const { return _technology; }
    /// Messages that arrived and were not dropped, including queued ones.
    [[nodiscard]] std::uint64_t messages() const { return _writer ? _writer->messages() : 0; }
    /// The bytes of these.
    [[nodiscard]] std::uint64_t bytes() const { return _bytes; }
    /// Those of these that are not in the file.
    [[nodiscard]] pcapngBlocks::PacketCount unsaved() const {
        return _writer ? _writer->unsaved() : pcapngBlocks::PacketCount();
    }
    /// Sentences of the receiver that arrived.
    [[nodiscard]] std::uint64_t sentences() const { return _sentences; }
    /// Messages dropped while the file could not be written.
    [[nodiscard]] std::uint64_t dropped() const { return _writer ? _writer->droppedMessages() : 0; }
    /// The temporary error; empty when there is none. Messages are queued meanwhile.
    [[nodiscard]] const std::string& temporaryError() const { return _temporaryError; }
    /// A change of file.
    struct Move {
        std::string reason; ///< "drive.pcapng was removed"
        std::string file;   ///< in which the recording continues
    };
    [[nodiscard]] const std::vector<Move>& moves() const { return _moves; }
    /// Of the messages, those that were left to the files after the first.
    [[nodiscard]] std::uint64_t messagesSinceMove() const {
        return messages() - _messagesBeforeMove.value_or(0);
    }
    /// The present file.
    [[nodiscard]] const std::string& file() const { return _file.path; }
    /// Whether the queue is full.
    [[nodiscard]] bool isDropping() const { return _writer && _writer->isDropping(); }
    /// Whether the recording goes to a pipe or the like, where a reader may wait for each message.
    [[nodiscard]] bool isLive() const { return _isLive; }
    /// Whether the recording goes to a pipe whose reader has closed it.
    [[nodiscard]] bool hasClosedReader() const;
    /// Removes the file that this has created, if it is still empty: for a program that ends without
    /// destructors. Allocates nothing.
    void removeIfEmpty() const { _file.removeIfEmpty(); }

private:
    explicit RecordingSession(RecordingFile file) : _path(file.path), _file(std::move(file)) {}

    [[nodiscard]] Result<std::unique_ptr<PcapngWriter>> startWriter(std::string_view technology);
    [[nodiscard]] Result<std::unique_ptr<PcapngWriter>> overwriteWith(std::string_view technology);
    [[nodiscard]] Result<Done> moveOn(OutputFile::Change::Kind change);
    /// Turns a temporary error into success, and keeps its reason.
    [[nodiscard]] Result<Done> keepTemporaryError(Result<Done> result);

    std::string _path;   ///< of the first file
    RecordingFile _file; ///< the present one; open as long as it may have to be removed
    bool _isLive = false;
    std::unique_ptr<PcapngWriter> _writer;
    std::string _technology;
    std::string _temporaryError;
    std::uint64_t _bytes = 0;
    std::uint64_t _sentences = 0;
    PcapngWriter::Positions _positions = PcapngWriter::Positions::Without;
    std::vector<std::string> _notes; ///< for the next message
    std::vector<Move> _moves;
    std::optional<std::uint64_t> _messagesBeforeMove;
};

} // namespace velmora

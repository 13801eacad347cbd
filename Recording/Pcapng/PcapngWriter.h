// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Clock.h"
#include "Platform/Fix.h"
#include "Platform/Result.h"
#include "Recording/Files/OutputFile.h"
#include "Recording/Pcapng/PcapngBlocks.h"

#include <cstddef>
#include <cstdint>
#include <memory>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// Writes a recording (see PcapngBlocks.h). Messages are buffered and written as complete blocks, so that a
/// killed writer loses the last ones and truncates at most one. Call `flush` where a reader waits at the
/// other end, `sync` at regular intervals where the recording must survive a power failure.
///
/// Failures of a regular file may be temporary: a full disk or quota, a limit on the file's size, storage
/// that fails or is currently read-only. A temporary failure alone loses nothing: the file is truncated to
/// its last complete block and up to 32 MiB of messages are queued; once the queue is full, further messages
/// are dropped until the failure is over, so that there is one gap and not many. Until then every call
/// returns the failure, and each `flush` and `sync` retries. After a permanent failure every call returns it
/// and nothing more is written. `hasTemporaryError` distinguishes the two.
///
/// A file that others have changed (see OutputFile::Change) is a temporary failure as well: messages are
/// queued until `continueIn` supplies another file.
///
/// Owns its file; destroying it closes it as `close` does, but reports no failure. Main thread only.
class PcapngWriter {
public:
    /// How much is queued during a temporary failure, in bytes of blocks.
    static constexpr std::size_t maximumQueue = std::size_t{32} << 20;
    /// How much of what is written but not yet synced is kept, to be written again when the sync fails.
    static constexpr std::size_t maximumUnsynced = std::size_t{8} << 20;

    /// Whether the recording has an interface of positions, after that of the messages.
    enum class Positions : std::uint8_t { Without, With };

    /// Creates the file, or empties it; "-" is standard output, which stays open afterwards. The file's head
    /// is written at once. `technology` is a technology's constant or short name, of at most 255 bytes. If
    /// writing the head fails temporarily, a writer is returned that is waiting.
    static Result<std::unique_ptr<PcapngWriter>> create(const std::string& path, std::string_view technology,
                                                        Positions positions = Positions::Without);
    /// Writes to an open descriptor, which it takes over; failures name it `name`.
    static Result<std::unique_ptr<PcapngWriter>> adopt(int descriptor, std::string name,
                                                       std::string_view technology,
                                                       Positions positions = Positions::Without);
    /// Writes to any file of which nothing has been written.
    static Result<std::unique_ptr<PcapngWriter>> start(std::unique_ptr<OutputFile> file, std::string name,
                                                       std::string_view technology,
                                                       Positions positions = Positions::Without);

    ~PcapngWriter();
    PcapngWriter(const PcapngWriter&) = delete;
    PcapngWriter& operator=(const PcapngWriter&) = delete;

    /// Adds a message as it arrived. A time before 1970 cannot be recorded and becomes 1970-01-01. A message
    /// above 16 MiB is refused, which does not end the recording. `comments`: texts about it, of at most
    /// 65535 bytes each. Precondition: it has not been closed.
    Result<Done> append(Time time, Bytes message, std::span<const std::string> comments = {});
    /// Adds an NMEA sentence as it arrived. It does not count as a message, and where messages are dropped it
    /// is dropped, too. Precondition: the recording has positions and has not been closed.
    Result<Done> appendSentence(Time time, std::string_view sentence);
    /// Adds a fix as sentences that arrived at its time.
    Result<Done> appendFix(const Fix& fix);
    /// Writes all messages so far to the file.
    Result<Done> flush();
    /// Flushes, and starts to sync the file in the background: a later call returns the result.
    Result<Done> sync();
    /// Continues in another file, of which nothing has been written: closes the present one and writes, after
    /// a head, what was not in it or has been removed from it with its end, as far as that is still in
    /// memory.
    Result<Done> continueIn(std::unique_ptr<OutputFile> file, std::string name);
    /// Flushes, syncs and closes the file. A second call does nothing.
    Result<Done> close();

    /// Messages added so far, queued ones included.
    [[nodiscard]] std::uint64_t messages() const { return _messages; }
    /// Messages dropped during temporary failures so far.
    [[nodiscard]] std::uint64_t droppedMessages() const { return _dropped; }
    /// Messages added that are not in the file.
    [[nodiscard]] pcapngBlocks::PacketCount unsaved() const;
    /// Whether there is a temporary failure.
    [[nodiscard]] bool hasTemporaryError() const { return _temporaryError.has_value(); }
    /// Whether messages are being dropped.
    [[nodiscard]] bool isDropping() const { return _dropping; }
    /// What others have done to the file, which keeps it from being written.
    [[nodiscard]] OutputFile::Change::Kind change() const { return _change.kind; }
    /// Of `messages()`, those that were written to this file, or are to be.
    [[nodiscard]] std::uint64_t messagesOfFile() const { return _messages - _messagesBefore; }

private:
    PcapngWriter(std::unique_ptr<OutputFile> file, std::string name);

    [[nodiscard]] std::size_t written() const { return static_cast<std::size_t>(_end - _base); }
    [[nodiscard]] Bytes waiting() const { return Bytes(_buffer).subspan(written()); }
    /// Makes room for blocks of that length. Whether they may be added now.
    [[nodiscard]] bool makeRoom(std::size_t length);
    /// What every call returns: the failure, or success if there is none.
    [[nodiscard]] Result<Done> outcome() const;
    /// Takes the result of the sync in the background, if it has ended. False if it failed.
    [[nodiscard]] bool collectSync();
    /// Syncs and waits for the result. False if it failed.
    [[nodiscard]] bool syncNow();
    /// Takes note that the file has been synced up to `end`, or that syncing failed. False if it failed.
    [[nodiscard]] bool applySyncResult(int error, std::uint64_t end);
    /// Makes it a temporary failure if others have changed the file. Whether they have.
    [[nodiscard]] bool noteChange();
    /// How much of the buffer is still in a file that others have changed.
    [[nodiscard]] std::size_t intactInBuffer() const;
    /// Makes the error a temporary failure where it may pass, else the permanent one.
    void noteFailure(const char* operation, int error);
    [[nodiscard]] Failure failureOf(const char* operation, int error) const;
    /// Removes the first `length` bytes of the buffer.
    void discardFront(std::size_t length);

    std::unique_ptr<OutputFile> _file; ///< null when closed
    std::string _name;
    std::vector<std::uint8_t> _head;   ///< section header and interface, for a file to continue in
    std::vector<std::uint8_t> _buffer; ///< complete blocks: unsynced ones, then those not yet in the file
    std::uint64_t _base = 0;           ///< where in the file the buffer begins
    std::uint64_t _end = 0;            ///< how long the file is
    std::uint64_t _syncing = 0;        ///< its length when the sync in progress was started
    std::uint64_t _synced = 0;         ///< how much of it has been synced
    bool _syncIsUnderWay = false;
    bool _keepsUnsynced = false; ///< `sync` is in use
    bool _dropping = false;
    std::uint64_t _messages = 0;
    std::uint64_t _messagesBefore = 0; ///< in earlier files
    std::uint64_t _dropped = 0;
    OutputFile::Change _change;             ///< by others; a temporary failure
    std::optional<Failure> _temporaryError; ///< temporary
    std::optional<Failure> _permanentError; ///< permanent
};

} // namespace velmora

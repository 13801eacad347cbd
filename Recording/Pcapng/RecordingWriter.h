// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Clock.h"
#include "Platform/Result.h"
#include "Recording/Files/RecordingFile.h"
#include "Recording/Pcapng/RecordingBlocks.h"

#include <cstddef>
#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// Writes a recording (see RecordingBlocks.h). Messages are gathered and written as whole blocks, so that a
/// writer that is killed leaves out the last ones and cuts at most one. Call `flush` where a reader waits on
/// the other side, `sync` at a steady pace where the recording must outlive the machine's power.
///
/// Trouble with a regular file may pass: a full disk or quota, a limit on the file's size, a medium that
/// fails or may not be written at the moment. It loses nothing by itself: the file is cut back to its last
/// whole block and the messages wait, up to 32 MiB of them; only those that find no room are dropped, and all
/// that follow, so that there is one gap and not many. Until it has passed every call gives the failure, and
/// each `flush` and `sync` tries again. After any other failure every call gives that one and nothing more is
/// written. `isWaiting` tells the two apart.
///
/// Owns its file; destroying it closes it as `close` does, but tells nobody how that went. Main thread only.
class RecordingWriter {
public:
    /// How much may wait for trouble to pass, in bytes of blocks.
    static constexpr std::size_t maximumQueue = std::size_t{32} << 20;
    /// How much of what is written but not known to be on the medium is kept, to be written once more when
    /// the medium says that it failed.
    static constexpr std::size_t maximumKept = std::size_t{8} << 20;

    /// Creates the file, or empties it; "-" is standard output, which stays open afterwards. The file's head
    /// is written at once. `technology` is a technology's constant or short name, of at most 255 bytes. Where
    /// the head meets trouble that may pass there is a writer, and it is waiting.
    static Result<std::unique_ptr<RecordingWriter>> create(const std::string& path,
                                                           std::string_view technology);
    /// Writes to an open descriptor, which it takes over; `name` is what failures call it.
    static Result<std::unique_ptr<RecordingWriter>> adopt(int descriptor, std::string name,
                                                          std::string_view technology);
    /// Writes to any file of which nothing has been written.
    static Result<std::unique_ptr<RecordingWriter>> start(std::unique_ptr<RecordingFile> file,
                                                          std::string name, std::string_view technology);

    ~RecordingWriter();
    RecordingWriter(const RecordingWriter&) = delete;
    RecordingWriter& operator=(const RecordingWriter&) = delete;

    /// Adds a message as it arrived. A moment before 1970 cannot be recorded and is taken for its beginning.
    /// A message above 16 MiB is refused, which does not end the recording. Precondition: it has not been
    /// closed.
    Result<Done> append(Time time, Bytes message);
    /// Hands all messages so far to the system.
    Result<Done> flush();
    /// Flushes, and begins to have all of it put on the medium, without waiting for that: how it went is told
    /// by a later call.
    Result<Done> sync();
    /// Flushes, has the system put the file on its medium, and closes it. The second call does nothing.
    Result<Done> close();

    /// Messages added so far, those that wait included.
    [[nodiscard]] std::uint64_t messages() const { return _messages; }
    /// Messages that found no room while trouble lasted, since the beginning.
    [[nodiscard]] std::uint64_t droppedMessages() const { return _dropped; }
    /// Messages added that are not in the file.
    [[nodiscard]] recordingBlocks::PacketCount unsaved() const;
    /// Whether there is trouble that may pass.
    [[nodiscard]] bool isWaiting() const { return _trouble.has_value(); }
    /// Whether messages are being dropped.
    [[nodiscard]] bool isDropping() const { return _dropping; }

private:
    RecordingWriter(std::unique_ptr<RecordingFile> file, std::string name);

    [[nodiscard]] std::size_t written() const { return static_cast<std::size_t>(_end - _base); }
    [[nodiscard]] Bytes waiting() const { return Bytes(_buffer).subspan(written()); }
    /// What every call gives; success while all is well.
    [[nodiscard]] Result<Done> outcome() const;
    /// Whether the medium has not failed.
    [[nodiscard]] bool takeSyncOutcome();
    /// Has the medium take everything, and waits for it. Whether it did.
    [[nodiscard]] bool settle();
    /// The medium has, or has not, taken the file up to `end`.
    [[nodiscard]] bool takeMediumsWord(int error, std::uint64_t end);
    void stumble(const char* operation, int error);
    [[nodiscard]] Failure failureOf(const char* operation, int error) const;
    /// Drops so much of the buffer's front.
    void forget(std::size_t length);

    std::unique_ptr<RecordingFile> _file; ///< null when closed
    std::string _name;
    std::vector<std::uint8_t> _buffer; ///< whole blocks: those kept, then those not yet in the file
    std::uint64_t _base = 0;           ///< where in the file the buffer begins
    std::uint64_t _end = 0;            ///< how long the file is
    std::uint64_t _syncing = 0;        ///< how long it was when the sync under way began
    std::uint64_t _synced = 0;         ///< how much of it is known to be on the medium
    bool _syncIsUnderWay = false;
    bool _keeps = false; ///< `sync` is in use
    bool _dropping = false;
    std::uint64_t _messages = 0;
    std::uint64_t _dropped = 0;
    std::optional<Failure> _trouble; ///< may pass
    std::optional<Failure> _failure; ///< for good
};

} // namespace velmora

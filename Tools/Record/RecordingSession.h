// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Platform/Linux/Files/FileDescriptor.h"
#include "Platform/Result.h"
#include "Recording/Pcapng/PcapngWriter.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// A recording that is being written. The file is created at once, so that an error shows at once; its head
/// is written when the technology is known. Without a technology no file is left. A file that is overwritten
/// is replaced in one step, by one that has its head. Main thread only.
class RecordingSession {
public:
    /// Opens the file, "-" being standard output. A regular file that is there already is refused unless
    /// `force`; even then it keeps its content until the technology is known.
    static Result<std::unique_ptr<RecordingSession>> open(const std::string& path, bool force);

    ~RecordingSession();
    RecordingSession(const RecordingSession&) = delete;
    RecordingSession& operator=(const RecordingSession&) = delete;

    /// To be called when the service has named the technology. The first call starts the recording; another
    /// technology after that is a failure.
    Result<Done> setTechnology(std::string_view technology);
    /// A message has arrived. A failure ends the recording; a temporary error is not a failure (see
    /// `temporaryError`). Precondition: the technology is known.
    Result<Done> append(Time time, Bytes message);
    /// Writes the buffer to the file and starts its sync to storage; does nothing before the technology is
    /// known. Retries after a temporary error. A failure is as above.
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
    /// Messages dropped while the file could not be written.
    [[nodiscard]] std::uint64_t dropped() const { return _writer ? _writer->droppedMessages() : 0; }
    /// The temporary error; empty when there is none. Messages are queued meanwhile.
    [[nodiscard]] const std::string& temporaryError() const { return _temporaryError; }
    /// Whether the queue is full.
    [[nodiscard]] bool isDropping() const { return _writer && _writer->isDropping(); }
    /// Whether the recording goes to a pipe or the like, where a reader may wait for each message.
    [[nodiscard]] bool isLive() const { return _isLive; }
    /// Whether the recording goes to a pipe whose reader has closed it.
    [[nodiscard]] bool hasClosedReader() const;
    /// Removes the file that this has created, if it is still empty: for a program that ends without
    /// destructors. Allocates nothing.
    void removeIfEmpty() const;

private:
    explicit RecordingSession(std::string path) : _path(std::move(path)) {}

    /// Turns a temporary error into success, and keeps its reason.
    [[nodiscard]] Result<Done> keepTemporaryError(Result<Done> result);

    std::string _path;
    FileDescriptor _file;  ///< until the writer has it
    bool _created = false; ///< this created the file
    bool _isLive = false;
    std::unique_ptr<PcapngWriter> _writer;
    std::string _technology;
    std::string _temporaryError;
    std::uint64_t _bytes = 0;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Playback/MessageSpool.h"
#include "Recording/Files/SharedFile.h"
#include "Recording/MessageReader.h"
#include "Recording/Pcapng/PcapngReader.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <utility>

namespace velmora {

/// Where a message begins, as the file's form finds it again.
struct MessagePlace {
    std::shared_ptr<const PcapngReader::Place> recording; ///< null where the messages are spooled
    std::uint64_t spooled = 0;                            ///< in the spool
};

/// A file of log messages that is read from the front once, and again from any place that was passed then.
/// A recording is read again in the file itself; what is compressed or of another form is spooled while it is
/// read first. Main thread only.
class PlayedFile {
public:
    /// Makes of a reader of the file one that returns its messages otherwise, such as masked. It must read no
    /// further than the message that it returns, and return the same ones in each reading.
    using Wrapping = std::function<std::unique_ptr<MessageReader>(std::unique_ptr<MessageReader>)>;

    /// Opens a regular file of any form that openMessages reads; the reason does not repeat the path. What is
    /// spooled has been wrapped.
    static Result<std::unique_ptr<PlayedFile>> open(const std::string& path, Wrapping wrapping = {});

    /// The next message of the first reading; none at the end, and where it fails (see `failure`).
    [[nodiscard]] std::optional<LoggedMessage> next();
    /// Where the message begins that `next` returns next.
    [[nodiscard]] MessagePlace place() const;
    /// The first reading: technologies, losses.
    [[nodiscard]] const MessageReader& reader() const { return *_reader; }
    /// Why the first reading ended before the file's end; empty where it has not.
    [[nodiscard]] std::string failure() const;

    /// The messages from a place on.
    [[nodiscard]] Result<std::unique_ptr<MessageReader>> from(const MessagePlace& place) const;

    [[nodiscard]] const std::string& path() const { return _path; }
    /// How much of the file the first reading has read, 0 to 1.
    [[nodiscard]] double progress() const;
    /// How the file differs from when it was opened: "has grown", "has changed"; empty where it does not.
    [[nodiscard]] std::string change() const { return _file->change(); }

private:
    PlayedFile(std::string path, std::shared_ptr<SharedFile> file, Wrapping wrapping)
        : _path(std::move(path)), _file(std::move(file)), _wrapping(std::move(wrapping)) {}

    std::string _path;
    std::shared_ptr<SharedFile> _file;
    Wrapping _wrapping; ///< empty for messages as they are
    std::shared_ptr<std::uint64_t> _bytesRead = std::make_shared<std::uint64_t>(0);
    std::unique_ptr<MessageReader> _reader;
    PcapngReader* _recording = nullptr; ///< the reader, or what it wraps, where that can begin at a place
    std::unique_ptr<MessageSpool> _spool;
    std::string _spoolFailure;
};

} // namespace velmora

#pragma once

#include "Platform/Clock.h"
#include "Platform/Linux/FileDescriptor.h"
#include "Platform/Result.h"
#include "Recording/RecordingWriter.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// A recording in the making: the file is there from the beginning, so that trouble with it is told at once;
/// it gets its head when the technology is known. One that never comes so far leaves no file behind. Main
/// thread only.
class RecordingSession {
public:
    /// Opens the file, "-" being standard output. A regular file that is there already is refused unless
    /// `force`; even then it keeps its content until the technology is known.
    static Result<std::unique_ptr<RecordingSession>> open(const std::string& path, bool force);

    ~RecordingSession();
    RecordingSession(const RecordingSession&) = delete;
    RecordingSession& operator=(const RecordingSession&) = delete;

    /// The service has named the technology. The first time this begins the recording; another one after that
    /// is a failure.
    Result<Done> learnTechnology(std::string_view technology);
    /// A message has arrived. Precondition: the technology is known.
    Result<Done> append(Time time, Bytes message);
    /// Hands what there is to the system; nothing before the technology is known.
    Result<Done> flush();
    /// Ends the recording.
    Result<Done> close();

    /// The technology's short name; empty while it is unknown.
    [[nodiscard]] const std::string& technology() const { return _technology; }
    [[nodiscard]] std::uint64_t messages() const { return _messages; }
    /// The messages' bytes.
    [[nodiscard]] std::uint64_t bytes() const { return _bytes; }
    /// Whether the recording goes to a pipe that nobody reads any more.
    [[nodiscard]] bool hasLostReader() const;

private:
    explicit RecordingSession(std::string path) : _path(std::move(path)) {}

    std::string _path;
    FileDescriptor _file;  ///< until the writer has it
    bool _created = false; ///< the file is ours to remove
    std::unique_ptr<RecordingWriter> _writer;
    std::string _technology;
    std::uint64_t _messages = 0;
    std::uint64_t _bytes = 0;
};

} // namespace velmora

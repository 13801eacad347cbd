#pragma once

#include "Platform/Bytes.h"
#include "Platform/Clock.h"
#include "Platform/Result.h"

#include <cstddef>
#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// Writes a recording: a little-endian pcapng file of one section and one interface (link type 147,
/// nanoseconds, the technology as its name), then one Enhanced Packet Block a message.
///
/// Messages are gathered and written as whole blocks, so that a writer that is killed leaves out the last
/// ones and cuts none. Call `flush` where a reader waits on the other side. Once writing has failed every
/// call gives that failure again and nothing more is written. Owns its descriptor; destroying it closes it as
/// `close` does, but tells nobody how that went. Main thread only.
class RecordingWriter {
public:
    /// Creates the file, or empties it; "-" is standard output, which stays open afterwards. The file's head
    /// is written at once. `technology` is a technology's constant or short name, of at most 255 bytes.
    static Result<std::unique_ptr<RecordingWriter>> create(const std::string& path,
                                                           std::string_view technology);
    /// Writes to an open descriptor, which it takes over; `name` is what failures call it.
    static Result<std::unique_ptr<RecordingWriter>> adopt(int descriptor, std::string name,
                                                          std::string_view technology);

    ~RecordingWriter();
    RecordingWriter(const RecordingWriter&) = delete;
    RecordingWriter& operator=(const RecordingWriter&) = delete;

    /// Adds a message as it arrived. A moment before 1970 cannot be recorded and is taken for its beginning.
    /// A message above 16 MiB is refused, which does not end the recording. Precondition: it has not been
    /// closed.
    Result<Done> append(Time time, Bytes message);
    /// Hands all messages so far to the system.
    Result<Done> flush();
    /// Flushes, has the system put the file on its medium, and closes it. The second call does nothing.
    Result<Done> close();

    /// Messages added so far.
    [[nodiscard]] std::uint64_t messages() const { return _messages; }

private:
    RecordingWriter(int descriptor, bool owned, std::string name);
    static Result<std::unique_ptr<RecordingWriter>> start(std::unique_ptr<RecordingWriter> writer,
                                                          std::string_view technology);

    void putHead(std::string_view technology);
    void put16(std::uint16_t value);
    void put32(std::uint32_t value);
    void putPadded(Bytes bytes);
    void putOption(std::uint16_t code, Bytes value);
    void putOption(std::uint16_t code, std::string_view text);
    [[nodiscard]] Failure fail(const char* operation, int error);

    int _descriptor; ///< -1 when closed
    bool _owned;
    std::string _name;
    std::vector<std::uint8_t> _buffer; ///< whole blocks
    std::uint64_t _messages = 0;
    std::optional<Failure> _failure;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Clock.h"
#include "Platform/Result.h"
#include "Recording/Files/OutputFile.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// Writes a DLF log: the version report, then one record a message, so that DLFReader returns the same
/// messages again, byte for byte. A record is written without its type byte, as the format has it, where its
/// code implies the type (see impliedType). Any other message is written as it arrived, with type byte and
/// prefix, as in the application's own logs.
///
/// The log keeps no times but those in the records. A message that a reader could not find the end of,
/// because it has no complete header or its length field is not its length, is refused. Once writing has
/// failed every call returns that failure again and nothing more is written. Owns its file; destroying it
/// closes it as `close` does, but reports no failure. Main thread only.
class DLFWriter {
public:
    /// Creates the file, or empties it; "-" is standard output, which stays open afterwards. The version
    /// report, with the clock's time and this program's version from the resources, is written immediately.
    static Result<std::unique_ptr<DLFWriter>> create(const std::string& path, const Clock& clock);
    /// Writes to an open descriptor, which it takes over; failures name it `name`.
    static Result<std::unique_ptr<DLFWriter>> adopt(int descriptor, std::string name, const Clock& clock);
    /// Writes to any file of which nothing has been written.
    static Result<std::unique_ptr<DLFWriter>> start(std::unique_ptr<OutputFile> file, std::string name,
                                                    const Clock& clock);

    ~DLFWriter();
    DLFWriter(const DLFWriter&) = delete;
    DLFWriter& operator=(const DLFWriter&) = delete;

    /// Adds a message as it arrived. Fails for one that a log cannot hold, which does not end it and is
    /// counted. Precondition: it has not been closed.
    Result<Done> append(Bytes message);
    /// Writes all messages so far, syncs and closes the file. A second call does nothing.
    Result<Done> close();

    /// Messages added so far.
    [[nodiscard]] std::uint64_t messages() const { return _messages; }
    /// Messages that a log cannot hold.
    [[nodiscard]] std::uint64_t refused() const { return _refused; }
    /// Whether writing has failed.
    [[nodiscard]] bool hasFailed() const { return _failure.has_value(); }

private:
    DLFWriter(std::unique_ptr<OutputFile> file, std::string name);

    Result<Done> flush();
    [[nodiscard]] Failure failureOf(const char* operation, int error) const;

    std::unique_ptr<OutputFile> _file; ///< null when closed
    std::string _name;
    std::vector<std::uint8_t> _buffer; ///< complete records
    std::uint64_t _messages = 0;
    std::uint64_t _refused = 0;
    std::optional<Failure> _failure;
};

} // namespace velmora

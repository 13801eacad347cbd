// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Benchmarks/HandWritten/MeasurementLines.h"
#include "Benchmarks/PacketBlocks.h"
#include "LogMessages/LogMessage.h"

#include <cstdio>
#include <string_view>
#include <vector>

#include <fcntl.h>
#include <unistd.h>

// What JSON lines of every message cannot cost much less than: reads a recording that has LTE serving cell
// measurements (0xB17F) and nothing else, and writes their lines by hand. With --texts all values' texts are
// made at the start.

namespace velmora {
namespace {

using MadeTexts = MeasurementLines<ValueTexts>;
using WrittenTexts = MeasurementLines<WrittenValues>;
constexpr std::size_t longestLine = MadeTexts::longestLine;

/// Collects lines and writes them in large pieces.
class LineOutput {
public:
    /// Room for a line.
    char* room() { return &_buffer[_filled]; }
    /// Keeps what has been written to the room, up to `end`; false where the output cannot be written.
    bool keep(const char* end) {
        _filled = static_cast<std::size_t>(end - _buffer.data());
        return _filled < size || flush();
    }
    bool flush() {
        for (std::size_t at = 0; at < _filled;) {
            const ssize_t written = ::write(STDOUT_FILENO, &_buffer[at], _filled - at);
            if (written <= 0)
                return false;
            at += static_cast<std::size_t>(written);
        }
        _filled = 0;
        return true;
    }

private:
    static constexpr std::size_t size = std::size_t{1} << 16;
    std::vector<char> _buffer = std::vector<char>(size + longestLine);
    std::size_t _filled = 0;
};

template <class Lines>
bool write(int file) {
    PacketBlocks blocks;
    Lines lines;
    LineOutput output;
    bool hasRecord = false;
    return blocks.read(file, [&](const PacketBlocks::Packet& packet) {
        const auto message = LogMessage::parse(packet.message);
        if (!message || message->logCode() != Lines::code)
            return false;
        hasRecord = hasRecord || message->record.size() >= Lines::recordLength;
        return hasRecord && output.keep(lines.append(output.room(), packet.time_ns, message->record));
    }) && output.flush();
}

int run(int count, char** arguments) {
    const bool makesTexts = count == 3 && std::string_view(arguments[1]) == "--texts";
    if (count != 2 && !makesTexts) {
        std::fputs("usage: measurement-lines [--texts] FILE\n", stderr);
        return 2;
    }
    const char* const path = arguments[count - 1];
    const int file = ::open(path, O_RDONLY | O_CLOEXEC);
    if (file < 0 || !(makesTexts ? write<MadeTexts>(file) : write<WrittenTexts>(file))) {
        std::fprintf(stderr, "measurement-lines: %s: not a recording of 0xB17F alone\n", path);
        return 1;
    }
    ::close(file);
    return 0;
}

} // namespace
} // namespace velmora

int main(int count, char** arguments) {
    return velmora::run(count, arguments);
}

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Benchmarks/PacketBlocks.h"
#include "LogMessages/LogMessage.h"
#include "Platform/Bytes.h"

#include <bit>
#include <cstdint>
#include <cstdio>
#include <cstring>
#include <vector>

#include <fcntl.h>
#include <unistd.h>

// What decoding cannot cost less than: reads a recording, checks its blocks, frames every message as a log
// record and copies that into a buffer that is used again. It shows nothing, but that what it prints depends
// on all of it.

namespace velmora {
namespace {

struct Totals {
    std::uint64_t messages = 0;
    std::uint64_t records = 0;
    std::uint64_t bytes = 0;
    std::uint64_t codes = 0; ///< sum of the log codes
};

class Floor {
public:
    /// Reads to the end of the file; false where it is not as recordings are written, or cannot be read.
    bool run(int file) {
        return _blocks.read(file, [this](const PacketBlocks::Packet& packet) {
            ++_totals.messages;
            frame(packet.message);
            return true;
        });
    }

    [[nodiscard]] const Totals& totals() const { return _totals; }

private:
    void frame(Bytes message) {
        const auto parsed = LogMessage::parse(message);
        if (!parsed)
            return;
        const Bytes record = parsed->record;
        if (record.size() > _record.size())
            _record.resize(record.size());
        std::memcpy(_record.data(), record.data(), record.size());
        ++_totals.records;
        _totals.bytes += record.size();
        _totals.codes += numberAt<std::uint16_t>(&_record[LogMessage::codeOffset], std::endian::little);
    }

    PacketBlocks _blocks;
    std::vector<std::uint8_t> _record = std::vector<std::uint8_t>(4096);
    Totals _totals;
};

int run(int count, char** arguments) {
    if (count != 2) {
        std::fputs("usage: floor FILE\n", stderr);
        return 2;
    }
    const int file = ::open(arguments[1], O_RDONLY | O_CLOEXEC);
    Floor floor;
    if (file < 0 || !floor.run(file)) {
        std::fprintf(stderr, "floor: %s: not readable as a recording of ours\n", arguments[1]);
        return 1;
    }
    ::close(file);
    const Totals& totals = floor.totals();
    std::printf("%llu messages, %llu records, %llu bytes, codes %llu\n",
                static_cast<unsigned long long>(totals.messages),
                static_cast<unsigned long long>(totals.records),
                static_cast<unsigned long long>(totals.bytes), static_cast<unsigned long long>(totals.codes));
    return 0;
}

} // namespace
} // namespace velmora

int main(int count, char** arguments) {
    return velmora::run(count, arguments);
}

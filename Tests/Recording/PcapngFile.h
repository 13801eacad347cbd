// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/Pcapng/PcapngReader.h"
#include "Tests/Support/Hex.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

/// Capture files for tests, put together block by block, and what a reader makes of them as plain text.

namespace velmora {

/// Blocks one after another, in one byte order. Every call appends.
class PcapngFile {
public:
    explicit PcapngFile(bool bigEndian = false) : _bigEndian(bigEndian) {}

    /// A block of that type, its lengths right, its body padded.
    PcapngFile& block(std::uint32_t type, Bytes body);
    /// A section header without options.
    PcapngFile& section();
    /// An interface description; `options` is appended unchanged.
    PcapngFile& interface(std::uint16_t linkType, Bytes options = {}, std::uint32_t snapLength = 0);
    /// One of link type 147 with nanoseconds and, unless it is empty, a name.
    PcapngFile& messageInterface(std::string_view name);
    /// An Enhanced Packet Block on the interface.
    PcapngFile& message(std::uint64_t stamp, Bytes message, std::uint32_t interface = 0);
    /// A section and an interface "Ostrel_GSM": 76 bytes.
    PcapngFile& head();
    PcapngFile& raw(Bytes bytes);

    [[nodiscard]] Data option(std::uint16_t code, Bytes value) const;
    [[nodiscard]] std::size_t size() const { return _bytes.size(); }
    [[nodiscard]] std::vector<std::uint8_t>& bytes() { return _bytes; }
    [[nodiscard]] Data data() const { return Data::copyOf(_bytes); }

    /// The number in this file's byte order.
    [[nodiscard]] Data number(std::uint64_t value, std::size_t width) const;

private:
    bool _bigEndian;
    std::vector<std::uint8_t> _bytes;
};

/// Returns memory in reads of at most `piece` bytes; after `good` bytes reading fails.
class MemorySource final : public ByteSource {
public:
    explicit MemorySource(Data data, std::size_t piece = SIZE_MAX, std::size_t good = SIZE_MAX)
        : _data(std::move(data)), _piece(piece), _good(good) {}
    Result<std::size_t> read(std::span<std::uint8_t> buffer) override;

private:
    Data _data;
    std::size_t _piece;
    std::size_t _good;
    std::size_t _at = 0;
};

/// What a reader returned until its end.
struct ReadOut {
    std::string technology;
    std::vector<std::string> messages; ///< "1 at 76, 5 ns: 0A0B"
    std::vector<std::string> losses; ///< "at 76, 36 bytes, record 1: reason", with ", tail" before the colon
    std::string failure;             ///< of opening or of reading
    PcapngReader::PassedOver passedOver;
};

[[nodiscard]] std::string hexText(Bytes bytes);
[[nodiscard]] std::string describe(const LoggedMessage& message);
[[nodiscard]] std::string describe(const Loss& loss);
[[nodiscard]] ReadOut readOut(const Data& file, std::size_t piece = SIZE_MAX, std::size_t good = SIZE_MAX);

} // namespace velmora

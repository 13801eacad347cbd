// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Recording/PcapngFile.h"

#include <algorithm>
#include <memory>

namespace velmora {

Data PcapngFile::number(std::uint64_t value, std::size_t width) const {
    std::vector<std::uint8_t> bytes(width);
    for (std::size_t i = 0; i < width; ++i)
        bytes[_bigEndian ? width - 1 - i : i] = static_cast<std::uint8_t>(value >> 8 * i);
    return Data(std::move(bytes));
}

Data PcapngFile::option(std::uint16_t code, Bytes value) const {
    const std::vector<std::uint8_t> padding((4 - value.size() % 4) % 4);
    return joined(number(code, 2), number(value.size(), 2), Data::copyOf(value), Data::copyOf(padding));
}

PcapngFile& PcapngFile::raw(Bytes bytes) {
    _bytes.insert(_bytes.end(), bytes.begin(), bytes.end());
    return *this;
}

PcapngFile& PcapngFile::block(std::uint32_t type, Bytes body) {
    const std::vector<std::uint8_t> padding((4 - body.size() % 4) % 4);
    const Data length = number(12 + body.size() + padding.size(), 4);
    raw(number(type, 4).bytes()).raw(length.bytes()).raw(body).raw(padding);
    return raw(length.bytes());
}

PcapngFile& PcapngFile::section() {
    return block(0x0A0D0D0A,
                 joined(number(0x1A2B3C4D, 4), number(1, 2), number(0, 2), hex("FFFFFFFFFFFFFFFF")).bytes());
}

PcapngFile& PcapngFile::interface(std::uint16_t linkType, Bytes options, std::uint32_t snapLength) {
    return block(
        1, joined(number(linkType, 2), number(0, 2), number(snapLength, 4), Data::copyOf(options)).bytes());
}

PcapngFile& PcapngFile::messageInterface(std::string_view name) {
    Data options = option(9, hex("09").bytes());
    if (!name.empty())
        options =
            joined(option(2, {reinterpret_cast<const std::uint8_t*>(name.data()), name.size()}), options);
    return interface(147, joined(options, option(0, {})).bytes());
}

PcapngFile& PcapngFile::message(std::uint64_t stamp, Bytes message, std::uint32_t interface) {
    return block(6, joined(number(interface, 4), number(stamp >> 32, 4), number(stamp, 4),
                           number(message.size(), 4), number(message.size(), 4), Data::copyOf(message))
                        .bytes());
}

PcapngFile& PcapngFile::head() {
    return section().messageInterface("Ostrel_GSM");
}

Result<std::size_t> MemorySource::read(std::span<std::uint8_t> buffer) {
    if (_at >= _good)
        return Failure{"cannot read: Input/output error"};
    const Bytes rest = _data.bytes().subspan(_at);
    const std::size_t count = std::min({buffer.size(), rest.size(), _piece, _good - _at});
    std::copy_n(rest.begin(), count, buffer.begin());
    _at += count;
    return count;
}

std::string hexText(Bytes bytes) {
    std::string text;
    for (const std::uint8_t byte : bytes)
        text += {"0123456789ABCDEF"[byte >> 4], "0123456789ABCDEF"[byte & 0xF]};
    return text;
}

std::string describe(const LoggedMessage& message) {
    return std::to_string(message.number) + " at " + std::to_string(message.offset) + ", " +
           std::to_string(message.time.time_since_epoch().count()) +
           " ns: " + hexText(message.message.bytes());
}

std::string describe(const Loss& loss) {
    return "at " + std::to_string(loss.offset) + ", " + std::to_string(loss.bytes) + " bytes, record " +
           std::to_string(loss.recordNumber) + (loss.isTruncation ? ", tail: " : ": ") + loss.reason;
}

ReadOut readOut(const Data& file, std::size_t piece, std::size_t good) {
    ReadOut out;
    auto reader = PcapngReader::open(ChunkedInput(std::make_unique<MemorySource>(file, piece, good)));
    if (!reader) {
        out.failure = reader.reason();
        return out;
    }
    while (const std::optional<LoggedMessage> message = (*reader)->next())
        out.messages.push_back(describe(*message));
    for (const Loss& loss : (*reader)->losses())
        out.losses.push_back(describe(loss));
    if ((*reader)->failure())
        out.failure = (*reader)->failure()->reason;
    out.technology = (*reader)->technology();
    out.passedOver = (*reader)->passedOver();
    return out;
}

} // namespace velmora

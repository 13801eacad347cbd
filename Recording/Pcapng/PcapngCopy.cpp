// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Pcapng/PcapngCopy.h"

#include "Recording/Pcapng/OptionReader.h"
#include "Recording/Pcapng/Pcapng.h"

#include <algorithm>

namespace velmora::pcapngCopy {

namespace {

using Buffer = std::vector<std::uint8_t>;

constexpr std::size_t sectionLengthOffset = 16;
constexpr std::size_t interfaceOptionsOffset = 16;

/// Appends a number in the block's byte order.
void put(Buffer& buffer, std::uint32_t value, std::size_t width, bool bigEndian) {
    for (std::size_t i = 0; i < width; ++i) {
        const std::size_t shift = 8 * (bigEndian ? width - 1 - i : i);
        buffer.push_back(static_cast<std::uint8_t>(value >> shift));
    }
}

void putOption(Buffer& buffer, std::uint16_t code, Bytes value, bool bigEndian) {
    put(buffer, code, 2, bigEndian);
    put(buffer, static_cast<std::uint32_t>(value.size()), 2, bigEndian);
    buffer.insert(buffer.end(), value.begin(), value.end());
    buffer.resize(buffer.size() + pcapng::padded(value.size()) - value.size());
}

} // namespace

bool mayBeCopied(const BlockReader::Block& block) {
    return block.type != pcapng::BlockType::CustomNotCopied;
}

Buffer sectionHeader(const BlockReader::Block& block) {
    Buffer copy(block.bytes.begin(), block.bytes.end());
    if (copy.size() >= sectionLengthOffset + 8 + 4)
        std::fill_n(copy.begin() + sectionLengthOffset, 8, std::uint8_t{0xFF});
    return copy;
}

Buffer renamedInterface(const BlockReader::Block& block, std::string_view name) {
    const Bytes fixed = block.bytes.first(interfaceOptionsOffset);
    Buffer copy(fixed.begin(), fixed.end());
    putOption(copy, pcapng::Option::InterfaceName,
              Bytes(reinterpret_cast<const std::uint8_t*>(name.data()), name.size()), block.bigEndian);
    OptionReader options(block.bytes.first(block.bytes.size() - 4).subspan(interfaceOptionsOffset),
                         block.bigEndian);
    while (const auto option = options.next())
        if (option->code != pcapng::Option::InterfaceName)
            putOption(copy, option->code, option->value, block.bigEndian);
    putOption(copy, pcapng::Option::End, {}, block.bigEndian);
    const auto length = static_cast<std::uint32_t>(copy.size() + 4);
    put(copy, length, 4, block.bigEndian);
    std::copy(copy.end() - 4, copy.end(), copy.begin() + 4);
    return copy;
}

} // namespace velmora::pcapngCopy

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/Pseudonyms/Permutation.h"

#include <vector>

namespace velmora {

namespace {

constexpr std::uint8_t rounds = 8;

} // namespace

void fillKeyed(const KeyedHash& hash, Bytes message, std::span<std::uint8_t> digits, unsigned radix) {
    std::vector<std::uint8_t> input(message.begin(), message.end());
    input.push_back(0);
    const unsigned usable = 256 - 256 % radix; // bytes from there on would make some digits likelier
    for (std::size_t filled = 0; filled < digits.size(); ++input.back())
        for (const std::uint8_t byte : hash(input))
            if (byte < usable && filled < digits.size())
                digits[filled++] = static_cast<std::uint8_t>(byte % radix);
}

void permute(const KeyedHash& hash, PseudonymKind kind, std::span<std::uint8_t> digits, unsigned radix) {
    const auto left = digits.first(digits.size() / 2);
    const auto right = digits.subspan(digits.size() / 2);
    std::vector<std::uint8_t> message;
    std::vector<std::uint8_t> addends;
    for (std::uint8_t round = 0; round < rounds; ++round) {
        const auto changed = round % 2 == 0 ? left : right;
        const auto other = round % 2 == 0 ? right : left;
        message.assign({static_cast<std::uint8_t>(kind), static_cast<std::uint8_t>(radix), round,
                        static_cast<std::uint8_t>(digits.size()),
                        static_cast<std::uint8_t>(digits.size() >> 8)});
        message.insert(message.end(), other.begin(), other.end());
        addends.resize(changed.size());
        fillKeyed(hash, message, addends, radix);
        for (std::size_t i = 0; i < changed.size(); ++i)
            changed[i] = static_cast<std::uint8_t>((changed[i] + addends[i]) % radix);
    }
}

} // namespace velmora

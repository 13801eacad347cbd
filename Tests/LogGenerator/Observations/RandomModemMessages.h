// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "PropertyLists/Value.h"

#include <cstdint>
#include <random>
#include <span>
#include <string_view>

namespace velmora {

/// Messages of the technology Modem that no service sends: every key with numbers within and out of range,
/// values of the wrong kind, cells of every technology, and payloads that are no dictionary.
class RandomModemMessages {
public:
    explicit RandomModemMessages(std::uint64_t seed) : _random(seed) {}

    [[nodiscard]] Data next();

private:
    [[nodiscard]] std::int64_t between(std::int64_t least, std::int64_t most);
    [[nodiscard]] bool oneOf(int count) { return between(1, count) == 1; }
    [[nodiscard]] Value number();
    [[nodiscard]] Value text();
    [[nodiscard]] Value any();
    [[nodiscard]] Value textList();
    [[nodiscard]] Value cell();
    /// A dictionary with some of the keys.
    [[nodiscard]] DictionaryRef some(std::span<const std::string_view> keys);
    [[nodiscard]] Value rows(std::span<const std::string_view> keys);
    [[nodiscard]] Value contexts();

    std::mt19937_64 _random;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <array>
#include <cstdint>
#include <memory>

namespace velmora {

/// HMAC-SHA-256 (RFC 2104, FIPS 180-4) under one key.
class KeyedHash {
public:
    static constexpr std::size_t length = 32;
    using Digest = std::array<std::uint8_t, length>;

    explicit KeyedHash(Bytes key);
    ~KeyedHash();
    KeyedHash(const KeyedHash&) = delete;
    KeyedHash& operator=(const KeyedHash&) = delete;

    [[nodiscard]] Digest operator()(Bytes message) const;

private:
    struct State;
    std::unique_ptr<State> _state;
};

/// SHA-256 of what is added.
class Hash {
public:
    Hash();
    ~Hash();
    Hash(const Hash&) = delete;
    Hash& operator=(const Hash&) = delete;

    void add(Bytes bytes);
    /// Of all that was added so far; then it begins again.
    [[nodiscard]] KeyedHash::Digest digest();

private:
    struct State;
    std::unique_ptr<State> _state;
};

} // namespace velmora

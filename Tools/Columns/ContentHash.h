// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <memory>
#include <string>

namespace velmora {

/// The hash by which tables name an input: XXH3 of 128 bits. It finds the same content again; it is no proof
/// against content that is made to have the same one.
class ContentHash {
public:
    ContentHash();
    ~ContentHash();
    ContentHash(const ContentHash&) = delete;
    ContentHash& operator=(const ContentHash&) = delete;

    void add(Bytes bytes);
    /// Of all that has been added: 32 hexadecimal digits.
    [[nodiscard]] std::string digits() const;

private:
    struct State;
    std::unique_ptr<State> _state;
};

} // namespace velmora

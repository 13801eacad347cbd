// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <cstddef>
#include <functional>
#include <span>
#include <string>

namespace velmora {

/// A bit field under test: where it lies (the byte with its lowest bit, that bit's number, its width), and
/// what it shows when it is zero, one, and all ones.
struct BitField {
    const char* label;
    std::size_t byte;
    unsigned bit;
    unsigned width;
    const char* zero;
    const char* one;
    const char* ones;
};

/// Fills a record or entry of `length` bytes with zeros and sets one field after the other to all ones and to
/// one, then the other way round fills it with ones and sets each field to zero and to one: so each field's
/// neighbouring bits are the opposite of its own. Expects what `show` then returns to be the row of all the
/// table's labels, of which only that field's (and those that share its bits) differ from the filling's.
void expectBitFields(std::span<const BitField> table, std::size_t length,
                     const std::function<std::string(Bytes)>& show);

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/ValueEncodings.h"
#include "Platform/Bytes.h"

#include <bitset>
#include <cstddef>
#include <cstdint>
#include <set>
#include <string>
#include <unordered_map>
#include <utility>
#include <vector>

namespace velmora {

class Value;

/// Looks for values in bytes, in any encoding.
class KnownValues {
public:
    /// Values whose text is shorter than `shortestEncoding` are never found.
    explicit KnownValues(const std::vector<std::string>& values);

    /// The value's index and how it was found.
    using Finding = std::pair<std::size_t, ValueEncoding>;
    [[nodiscard]] const std::set<Finding>& findings() const { return _findings; }
    /// How many bytes of one call's end are to be repeated at the start of the next, so that nothing is
    /// missed in between.
    [[nodiscard]] std::size_t overlap() const { return _longest == 0 ? 0 : _longest - 1; }

    /// Adds what is in the bytes, and in what gzip and zlib have compressed there.
    void search(Bytes bytes);
    /// Adds what is in the property list's texts and data, whatever form it was read from.
    void search(const Value& list);

private:
    struct Pattern {
        std::size_t value;
        EncodedValue encoded;
    };

    void searchPlain(Bytes bytes);
    void searchCompressed(Bytes bytes, unsigned depth);
    void inflateFrom(Bytes bytes, unsigned depth);

    std::vector<Pattern> _patterns;
    std::unordered_map<std::uint32_t, std::vector<std::size_t>> _byStart; ///< by the first four bytes
    std::bitset<std::size_t{1} << 16> _starts;                            ///< by the first two
    std::size_t _longest = 0;
    std::set<Finding> _findings;
};

} // namespace velmora

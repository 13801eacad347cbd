// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/Pseudonyms/Permutation.h"

#include <cstdint>
#include <unordered_map>

namespace velmora {

/// The radio technology whose cell identities are meant, by how they are made up.
enum class CellIdentityForm : std::uint8_t {
    GSM,  ///< 16 bits (3GPP TS 23.003 4.3.1)
    UMTS, ///< 12 bits of the controller and 16 of the cell (3GPP TS 25.331 10.3.2.2)
    LTE,  ///< 20 bits of the eNB and 8 of the cell (3GPP TS 36.413 9.2.1.38)
    NR,   ///< 36 bits, taken for 24 of the gNB and 12 of the cell (3GPP TS 38.413 9.3.1.7)
};

/// Pseudonyms of numbers: each is a number of the same width, by a keyed permutation. 0 and the numbers with
/// all bits set stand for no value in records and stay as they are.
class NumberPseudonyms {
public:
    /// `hash` must outlive it.
    explicit NumberPseudonyms(const KeyedHash& hash) : _hash(hash) {}

    /// Of a number that has so many bits at most, in a field of `width` bits; one that has more is replaced
    /// by another that has.
    [[nodiscard]] std::uint64_t number(PseudonymKind kind, std::uint64_t value, unsigned bits,
                                       unsigned width);
    /// A location, tracking or routing area code; the values that denote a deleted area stay as well (3GPP TS
    /// 23.003 4.1, 19.4.2.3).
    [[nodiscard]] std::uint64_t area(PseudonymKind kind, std::uint64_t value, unsigned bits, unsigned width);
    /// Cells of one site stay cells of one site.
    [[nodiscard]] std::uint64_t cell(CellIdentityForm form, std::uint64_t value, unsigned width);
    /// Codes of 000 to 999; a network code below 100 stays below 100, since two digits may be all it has.
    [[nodiscard]] unsigned countryCode(unsigned code);
    [[nodiscard]] unsigned networkCode(unsigned code);

private:
    /// The kind's permutation of the numbers of that many bits, without the caller's exceptions.
    [[nodiscard]] std::uint64_t permuted(PseudonymKind kind, std::uint64_t value, unsigned bits);
    [[nodiscard]] unsigned decimal(PseudonymKind kind, unsigned code, unsigned digits);
    void keep(std::uint64_t key, std::uint64_t pseudonym);

    static constexpr std::size_t mostCached = std::size_t{1} << 16;

    const KeyedHash& _hash;
    std::unordered_map<std::uint64_t, std::uint64_t> _cache;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/Pseudonyms/NumberPseudonyms.h"

#include <array>

namespace velmora {

namespace {

constexpr unsigned mostBits = 48;

/// Of numbers of so many bits, up to `mostBits`, or of so many decimal digits.
std::uint64_t cacheKey(PseudonymKind kind, std::uint64_t value, unsigned size) {
    return value | std::uint64_t{size} << 48 | std::uint64_t{static_cast<std::uint8_t>(kind)} << 56;
}
constexpr unsigned decimalDigits = mostBits + 1; ///< added to their number

std::uint64_t allOnes(unsigned bits) {
    return (std::uint64_t{1} << bits) - 1;
}

} // namespace

std::uint64_t NumberPseudonyms::permuted(PseudonymKind kind, std::uint64_t value, unsigned bits) {
    const std::uint64_t key = cacheKey(kind, value, bits);
    if (const auto cached = _cache.find(key); cached != _cache.end())
        return cached->second;
    std::array<std::uint8_t, mostBits> digits{};
    for (unsigned i = 0; i < bits; ++i)
        digits[i] = value >> i & 1;
    permute(_hash, kind, std::span(digits).first(bits), 2);
    std::uint64_t result = 0;
    for (unsigned i = 0; i < bits; ++i)
        result |= std::uint64_t{digits[i]} << i;
    keep(key, result);
    return result;
}

void NumberPseudonyms::keep(std::uint64_t key, std::uint64_t pseudonym) {
    if (_cache.size() >= mostCached)
        _cache.clear();
    _cache.emplace(key, pseudonym);
}

std::uint64_t NumberPseudonyms::number(PseudonymKind kind, std::uint64_t value, unsigned bits,
                                       unsigned width) {
    const std::uint64_t most = allOnes(bits);
    if (value == 0 || value == most || value == allOnes(width))
        return value;
    // Where the permutation leads out of what the value may become, it is followed until it leads in again:
    // that is a permutation of what it may become.
    if (value < most) {
        do
            value = permuted(kind, value, bits);
        while (value == 0 || value == most);
        return value;
    }
    do
        value = permuted(kind, value, width);
    while (value <= most || value == allOnes(width));
    return value;
}

std::uint64_t NumberPseudonyms::area(PseudonymKind kind, std::uint64_t value, unsigned bits, unsigned width) {
    const std::uint64_t deleted = allOnes(bits) - 1;
    if (value == deleted)
        return value;
    do
        value = number(kind, value, bits, width);
    while (value == deleted);
    return value;
}

std::uint64_t NumberPseudonyms::cell(CellIdentityForm form, std::uint64_t value, unsigned width) {
    struct Parts {
        PseudonymKind site, cell;
        unsigned siteBits, cellBits;
    };
    static constexpr Parts partsOfForms[] = {
        {PseudonymKind::GSMCell, PseudonymKind::GSMCell, 0, 16},
        {PseudonymKind::UMTSController, PseudonymKind::UMTSCell, 12, 16},
        {PseudonymKind::LTESite, PseudonymKind::LTESector, 20, 8},
        {PseudonymKind::NRSite, PseudonymKind::NRSector, 24, 12},
    };
    const Parts& parts = partsOfForms[static_cast<unsigned>(form)];
    const unsigned bits = parts.siteBits + parts.cellBits;
    if (parts.siteBits == 0 || value == 0 || value >= allOnes(bits))
        return number(parts.site, value, bits, width);
    do {
        // Some modems report identities without a site, which have none afterwards either.
        const std::uint64_t site =
            number(parts.site, value >> parts.cellBits, parts.siteBits, parts.siteBits);
        value =
            site << parts.cellBits | permuted(parts.cell, value & allOnes(parts.cellBits), parts.cellBits);
    } while (value == 0 || value == allOnes(bits));
    return value;
}

unsigned NumberPseudonyms::decimal(PseudonymKind kind, unsigned code, unsigned count) {
    const std::uint64_t key = cacheKey(kind, code, decimalDigits + count);
    if (const auto cached = _cache.find(key); cached != _cache.end())
        return static_cast<unsigned>(cached->second);
    std::array<std::uint8_t, 3> digits{};
    for (unsigned i = 0; i < count; ++i, code /= 10)
        digits[count - 1 - i] = static_cast<std::uint8_t>(code % 10);
    permute(_hash, kind, std::span(digits).first(count), 10);
    unsigned result = 0;
    for (unsigned i = 0; i < count; ++i)
        result = result * 10 + digits[i];
    keep(key, result);
    return result;
}

unsigned NumberPseudonyms::countryCode(unsigned code) {
    return code < 1000 ? decimal(PseudonymKind::CountryCode, code, 3) : 0;
}

unsigned NumberPseudonyms::networkCode(unsigned code) {
    if (code < 100)
        return decimal(PseudonymKind::NetworkCode, code, 2);
    if (code >= 1000)
        return 0;
    do
        code = decimal(PseudonymKind::NetworkCode, code, 3);
    while (code < 100);
    return code;
}

} // namespace velmora

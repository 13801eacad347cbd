// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/Pseudonyms/Permutation.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <unordered_map>

namespace velmora {

class NumberPseudonyms;

/// Pseudonyms of numbers that are written as digits: as many digits, at the same places among whatever else
/// stands between them. The same digits become the same pseudonym however they are grouped.
class DigitPseudonyms {
public:
    /// `networks` has the pseudonyms of country and network codes; null where these stay. Both must outlive
    /// it.
    DigitPseudonyms(const KeyedHash& hash, NumberPseudonyms* networks) : _hash(hash), _networks(networks) {}

    /// ITU-T E.118: the 89 stays, which all begin with; the check digit of one of 19 or 20 digits is right.
    [[nodiscard]] std::string iccid(std::string_view text);
    /// 3GPP TS 23.003 2.2: country and network code stay, or become their pseudonyms.
    [[nodiscard]] std::string imsi(std::string_view text);
    /// Its country and network code alone.
    [[nodiscard]] std::string networkOfIMSI(std::string_view text) const;
    /// GSMA SGP.02 2.2.2: 32 digits, the last two of which check the others; the 89 stays.
    [[nodiscard]] std::string eid(std::string_view text);
    [[nodiscard]] std::string phone(std::string_view text);
    /// IMEI and IMEISV (3GPP TS 23.003 6.2), with the check digit of 15 digits right; MEID and ESN, which are
    /// hexadecimal.
    [[nodiscard]] std::string equipment(std::string_view text);
    /// Digits of no known kind.
    [[nodiscard]] std::string digits(std::string_view text) {
        return replaced(PseudonymKind::Digits, text, 0);
    }
    /// Hexadecimal digits, in the case that they have.
    [[nodiscard]] std::string hexadecimal(PseudonymKind kind, std::string_view text);

private:
    /// The text with all decimal digits but the first `kept` replaced.
    [[nodiscard]] std::string replaced(PseudonymKind kind, std::string_view text, std::size_t kept);
    [[nodiscard]] std::string computed(PseudonymKind kind, std::string_view digits, std::size_t kept) const;
    void maskNetwork(std::string& digits) const;

    static constexpr std::size_t mostCached = 4096;

    const KeyedHash& _hash;
    NumberPseudonyms* _networks;
    std::unordered_map<std::string, std::string> _cache;
};

/// The digit that makes the number right by the check of ISO/IEC 7812-1 annex B.
[[nodiscard]] char checkDigitOf(std::string_view digits);
/// How many of an IMSI's digits are country and network code: 6 where all networks of the country have codes
/// of three digits, otherwise 5.
[[nodiscard]] std::size_t networkLengthOf(std::string_view imsi);

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/Pseudonyms/AddressPseudonyms.h"
#include "Export/Masking/Pseudonyms/DigitPseudonyms.h"
#include "Export/Masking/Pseudonyms/NumberPseudonyms.h"

#include <string>
#include <string_view>

namespace velmora {

/// Pseudonyms of texts that are more than one number. They are as long as the texts, but for addresses and
/// codes in them, and characters outside ASCII become an x each.
class TextPseudonyms {
public:
    /// What it refers to must outlive it. `masksAreas`: whether network and area codes are replaced too.
    TextPseudonyms(const KeyedHash& hash, NumberPseudonyms& numbers, DigitPseudonyms& digits,
                   const AddressPseudonyms& addresses, bool masksAreas)
        : _hash(hash), _numbers(numbers), _digits(digits), _addresses(addresses), _masksAreas(masksAreas) {}

    /// Everything but what is known to be harmless: the words of the field, network codes ("001-01") and area
    /// codes after their names ("LAC 4101").
    [[nodiscard]] std::string personal(std::string_view text) const;
    /// Nothing but what looks like a number of a subscriber or a phone: seven digits and more, in groups too
    /// where `joinsGroups`, eight hexadecimal ones and more, addresses.
    [[nodiscard]] std::string free(std::string_view text, bool joinsGroups = true) const;
    /// Letters alone, for what digits leave of a text; an F is a filler and stays.
    [[nodiscard]] std::string letters(std::string_view text) const;
    /// Letters that are no hexadecimal digits.
    [[nodiscard]] std::string otherLetters(std::string_view text) const;
    /// Letters become letters, digits digits.
    [[nodiscard]] std::string scrambled(std::string_view text) const;
    /// A network: "001-01", "00101", "001 01".
    [[nodiscard]] std::string network(std::string_view text) const;
    /// Network and area codes alone, in the midst of other text.
    [[nodiscard]] std::string areas(std::string_view text) const;

private:
    [[nodiscard]] std::string scrambledWhere(std::string_view text, bool (*isReplaced)(char)) const;
    [[nodiscard]] std::string areaCode(std::string_view name, std::string_view digits) const;
    [[nodiscard]] std::string walk(std::string_view text, bool scramblesUnknown) const;

    const KeyedHash& _hash;
    NumberPseudonyms& _numbers;
    DigitPseudonyms& _digits;
    const AddressPseudonyms& _addresses;
    bool _masksAreas;
};

} // namespace velmora

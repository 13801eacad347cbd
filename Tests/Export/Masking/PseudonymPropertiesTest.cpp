// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Export/Masking/ExampleKey.h"

#include <gtest/gtest.h>

#include <rapidcheck/gtest.h>

#include <algorithm>

// What holds for any value and any key.

namespace velmora {
namespace {

rc::Gen<std::string> digitsOfLength(std::size_t least, std::size_t most) {
    return rc::gen::mapcat(rc::gen::inRange<std::size_t>(least, most + 1), [](std::size_t length) {
        return rc::gen::container<std::string>(length, rc::gen::inRange('0', static_cast<char>('9' + 1)));
    });
}

MaskOptions anyKey(MaskLevel level = MaskLevel::Location) {
    MaskOptions options{{}, level};
    for (std::uint8_t& byte : options.key.bytes)
        byte = *rc::gen::arbitrary<std::uint8_t>();
    return options;
}

/// What a receiver of such a number checks: every second digit doubled, the sum of all digits a multiple
/// of 10.
bool isChecked(const std::string& digits) {
    int sum = 0;
    bool isDoubled = false;
    for (auto digit = digits.rbegin(); digit != digits.rend(); ++digit, isDoubled = !isDoubled) {
        const int value = (*digit - '0') * (isDoubled ? 2 : 1);
        sum += value / 10 + value % 10;
    }
    return sum % 10 == 0;
}

RC_GTEST_PROP(PseudonymProperties, CheckDigitsAreRight, ()) {
    Pseudonyms pseudonyms(anyKey());
    const std::string card = "89" + *digitsOfLength(17, 18);
    const std::string masked = pseudonyms.digits.iccid(card);
    RC_ASSERT(masked.size() == card.size() && masked.starts_with("89") && isChecked(masked));
    RC_ASSERT(isChecked(pseudonyms.digits.equipment(*digitsOfLength(15, 15))));
    const std::string embedded = pseudonyms.digits.eid("89" + *digitsOfLength(30, 30));
    unsigned rest = 0;
    for (const char digit : embedded)
        rest = (rest * 10 + static_cast<unsigned>(digit - '0')) % 97;
    RC_ASSERT(rest == 1U);
}

RC_GTEST_PROP(PseudonymProperties, DifferentDigitsStayDifferent, ()) {
    Pseudonyms pseudonyms(anyKey());
    const std::string one = *digitsOfLength(1, 20);
    std::string other = one;
    other[*rc::gen::inRange<std::size_t>(0, one.size())] = *rc::gen::inRange('0', ':');
    RC_ASSERT((pseudonyms.digits.phone(one) == pseudonyms.digits.phone(other)) == (one == other));
}

RC_GTEST_PROP(PseudonymProperties, CellsKeepTheirWidthAndTheirSite, ()) {
    Pseudonyms pseudonyms(anyKey());
    const auto form = *rc::gen::element(CellIdentityForm::GSM, CellIdentityForm::UMTS, CellIdentityForm::LTE,
                                        CellIdentityForm::NR);
    constexpr unsigned bitsOfForms[] = {16, 28, 28, 36};
    constexpr unsigned cellBitsOfForms[] = {16, 16, 8, 12};
    const unsigned bits = bitsOfForms[static_cast<unsigned>(form)];
    const unsigned cellBits = cellBitsOfForms[static_cast<unsigned>(form)];
    const auto cellOf = [&](std::uint64_t value) { return pseudonyms.numbers.cell(form, value, 40); };
    const std::uint64_t one = *rc::gen::inRange<std::uint64_t>(0, std::uint64_t{1} << bits);
    const std::uint64_t other =
        (one >> cellBits << cellBits) | *rc::gen::inRange<std::uint64_t>(0, std::uint64_t{1} << cellBits);
    RC_ASSERT(cellOf(one) >> bits == 0U);
    RC_ASSERT((cellOf(one) == cellOf(other)) == (one == other));
    const auto isNone = [&](std::uint64_t value) {
        return value == 0 || value == (std::uint64_t{1} << bits) - 1;
    };
    // An identity may leave its site only where the permutation passes one that stands for none.
    if (one >> cellBits != 0 && one >> cellBits != (std::uint64_t{1} << (bits - cellBits)) - 1 &&
        !isNone(one) && !isNone(other))
        RC_ASSERT(cellOf(one) >> cellBits == cellOf(other) >> cellBits);
}

RC_GTEST_PROP(PseudonymProperties, KeysHaveNothingInCommon, ()) {
    Pseudonyms one(anyKey());
    Pseudonyms other(anyKey());
    RC_PRE(one.hash(Bytes()) != other.hash(Bytes()));
    // A chance of one in 10^13 each.
    const std::string card = "89" + *digitsOfLength(17, 17);
    RC_ASSERT(one.digits.iccid(card) != other.digits.iccid(card));
    const std::string number = *digitsOfLength(13, 15);
    RC_ASSERT(one.digits.phone(number) != other.digits.phone(number));
}

RC_GTEST_PROP(PseudonymProperties, TextsKeepTheirLengthAndWhatIsNoLetterOrDigit, ()) {
    Pseudonyms pseudonyms(anyKey(MaskLevel::Identity));
    const auto text = *rc::gen::container<std::string>(rc::gen::inRange(' ', '\x7F'));
    for (const std::string& masked : {pseudonyms.texts.personal(text), pseudonyms.texts.scrambled(text)}) {
        RC_ASSERT(masked.size() == text.size());
        for (std::size_t i = 0; i < text.size(); ++i)
            if (std::isalnum(static_cast<unsigned char>(text[i])) == 0)
                RC_ASSERT(masked[i] == text[i]);
    }
}

} // namespace
} // namespace velmora

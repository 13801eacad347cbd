// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/Pseudonyms/TextPseudonyms.h"

#include <algorithm>
#include <vector>

namespace velmora {

namespace {

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

bool isLetter(char c) {
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
}

bool isHexadecimal(char c) {
    return isDigit(c) || (c >= 'a' && c <= 'f') || (c >= 'A' && c <= 'F');
}

/// A character of a word or a number.
bool isWord(char c) {
    return isDigit(c) || isLetter(c) || static_cast<unsigned char>(c) >= 0x80;
}

bool isAllDigits(std::string_view text) {
    return !text.empty() && std::ranges::all_of(text, isDigit);
}

std::string lowerCase(std::string_view text) {
    std::string result(text);
    for (char& c : result)
        if (c >= 'A' && c <= 'Z')
            c = static_cast<char>(c - 'A' + 'a');
    return result;
}

/// The words that SIM files are described with (3GPP TS 31.102 4.2); they say nothing of anybody.
constexpr std::string_view knownWords[] = {
    "0x",       "acc",    "allowed", "and",  "area",    "changed", "class",   "code",
    "deleted",  "eutran", "geran",   "gprs", "gsm",     "invalid", "lac",     "lai",
    "location", "lte",    "mcc",     "mnc",  "network", "not",     "nr",      "ngran",
    "of",       "p",      "plmn",    "rac",  "rai",     "roaming", "routing", "signature",
    "status",   "tac",    "tai",     "tmsi", "umts",    "updated", "utran",
};

std::size_t wordEnd(std::string_view text, std::size_t begin) {
    const auto end = std::find_if_not(text.begin() + static_cast<std::ptrdiff_t>(begin), text.end(), isWord);
    return static_cast<std::size_t>(end - text.begin());
}

/// The length of a network's codes with a separator, "001-01" or "310/410", at the offset; 0 where there are
/// none.
std::size_t networkLength(std::string_view text, std::size_t begin) {
    constexpr std::size_t countryLength = 3;
    const std::size_t end = wordEnd(text, begin);
    if (end - begin != countryLength || !isAllDigits(text.substr(begin, countryLength)) ||
        end == text.size() || (text[end] != '-' && text[end] != '/'))
        return 0;
    const std::string_view code = text.substr(end + 1, wordEnd(text, end + 1) - end - 1);
    return isAllDigits(code) && (code.size() == 2 || code.size() == 3) ? countryLength + 1 + code.size() : 0;
}

std::string withZeros(unsigned number, std::size_t width) {
    const std::string digits = std::to_string(number);
    return digits.size() < width ? std::string(width - digits.size(), '0') + digits : digits;
}

unsigned numberOf(std::string_view digits) {
    return static_cast<unsigned>(std::stoul(std::string(digits)));
}

} // namespace

std::string TextPseudonyms::scrambledWhere(std::string_view text, bool (*isReplaced)(char)) const {
    std::string result(text);
    if (std::ranges::none_of(text, isReplaced))
        return result;
    std::vector<std::uint8_t> message{static_cast<std::uint8_t>(PseudonymKind::Text)};
    message.insert(message.end(), text.begin(), text.end());
    std::vector<std::uint8_t> stream(text.size());
    fillKeyed(_hash, message, stream, 256);
    for (std::size_t i = 0; i < text.size(); ++i) {
        char& c = result[i];
        if (!isReplaced(c))
            continue;
        if (isDigit(c))
            c = static_cast<char>('0' + stream[i] % 10);
        else if (isLetter(c))
            c = static_cast<char>((c <= 'Z' ? 'A' : 'a') + stream[i] % 26);
        else
            c = 'x';
    }
    return result;
}

std::string TextPseudonyms::scrambled(std::string_view text) const {
    return scrambledWhere(text, isWord);
}

std::string TextPseudonyms::letters(std::string_view text) const {
    return scrambledWhere(text, [](char c) { return isWord(c) && !isDigit(c) && c != 'F' && c != 'f'; });
}

std::string TextPseudonyms::otherLetters(std::string_view text) const {
    return scrambledWhere(text, [](char c) { return isWord(c) && !isHexadecimal(c); });
}

std::string TextPseudonyms::network(std::string_view text) const {
    std::string digits;
    std::copy_if(text.begin(), text.end(), std::back_inserter(digits), isDigit);
    if (digits.size() < 5 || digits.size() > 6)
        return walk(text, true);
    if (!_masksAreas)
        return std::string(text);
    const std::string masked = withZeros(_numbers.countryCode(numberOf(digits.substr(0, 3))), 3) +
                               withZeros(_numbers.networkCode(numberOf(digits.substr(3))), digits.size() - 3);
    std::string result(text);
    auto next = masked.begin();
    for (char& c : result)
        if (isDigit(c))
            c = *next++;
    return result;
}

std::string TextPseudonyms::areaCode(std::string_view name, std::string_view digits) const {
    constexpr std::size_t longest = 8;
    if (!_masksAreas || digits.size() > longest)
        return std::string(digits);
    const unsigned code = numberOf(digits);
    std::uint64_t masked = code;
    if (name == "lac")
        masked = _numbers.area(PseudonymKind::LocationArea, code, 16, 32);
    else if (name == "tac")
        masked = code >> 16 == 0 ? _numbers.area(PseudonymKind::TrackingArea, code, 16, 16)
                                 : _numbers.area(PseudonymKind::TrackingArea, code, 24, 32);
    else
        masked = _numbers.area(PseudonymKind::RoutingArea, code, 8, 32);
    return withZeros(static_cast<unsigned>(masked), 0);
}

std::string TextPseudonyms::walk(std::string_view text, bool scramblesUnknown) const {
    std::string result;
    std::string before; // the word before, in lower case
    for (std::size_t at = 0; at < text.size();) {
        if (!isWord(text[at])) {
            result += text[at++];
            continue;
        }
        if (const std::size_t length = networkLength(text, at); length != 0) {
            result += network(text.substr(at, length));
            at += length;
            before.clear();
            continue;
        }
        const std::size_t end = wordEnd(text, at);
        const std::string_view word = text.substr(at, end - at);
        const bool isArea =
            (before == "lac" || before == "rac" || before == "tac") && isAllDigits(word) && word.size() <= 8;
        const std::string lower = lowerCase(word);
        if (isArea)
            result += areaCode(before, word);
        else if (!scramblesUnknown || std::ranges::find(knownWords, lower) != std::end(knownWords))
            result += word;
        else if (lower.starts_with("0x") && std::ranges::all_of(word.substr(2), isHexadecimal))
            result.append(word.substr(0, 2))
                .append(_digits.hexadecimal(PseudonymKind::Hexadecimal, word.substr(2)));
        else if (isAllDigits(word))
            result += _digits.digits(word);
        else if (std::ranges::all_of(word, isHexadecimal) && std::ranges::any_of(word, isDigit))
            result += _digits.hexadecimal(PseudonymKind::Hexadecimal, word);
        else
            result += scrambled(word);
        before = lower;
        at = end;
    }
    return result;
}

std::string TextPseudonyms::personal(std::string_view text) const {
    return walk(text, true);
}

std::string TextPseudonyms::areas(std::string_view text) const {
    return walk(text, false);
}

std::string TextPseudonyms::free(std::string_view text, bool joinsGroups) const {
    constexpr std::size_t fewestDigits = 7;
    constexpr std::size_t fewestHexadecimal = 8;
    if (static_cast<std::size_t>(std::ranges::count_if(text, isDigit)) < 4 && text.find(':') == text.npos)
        return std::string(text); // as most are
    std::string result;
    for (std::size_t at = 0; at < text.size();) {
        // An address reaches as far as its characters do.
        std::size_t end = at;
        while (end < text.size() && (isHexadecimal(text[end]) || text[end] == '.' || text[end] == ':'))
            ++end;
        const bool begins = at == 0 || !isWord(text[at - 1]);
        // A port or the end of a sentence may follow it.
        std::optional<std::string> address;
        for (; begins && end >= at + 3 && !address;
             end = at + text.substr(at, end - at).find_last_of(".:", end - at - 1)) {
            address = _addresses.text(text.substr(at, end - at));
            if (address) {
                result += *address;
                at = end;
                break;
            }
            if (text.substr(at, end - at).find_last_of(".:") == std::string_view::npos)
                break;
        }
        if (address)
            continue;
        // Digits, in groups of any size with one separator between.
        std::size_t digits = 0;
        std::size_t last = at;
        for (end = at; end < text.size(); ++end) {
            if (isDigit(text[end])) {
                ++digits;
                last = end + 1;
            } else if (end == at || !isDigit(text[end - 1]) || !joinsGroups ||
                       (text[end] != ' ' && text[end] != '-')) {
                break;
            }
        }
        std::size_t hexadecimalEnd = at;
        while (hexadecimalEnd < text.size() && isHexadecimal(text[hexadecimalEnd]))
            ++hexadecimalEnd;
        const std::string_view run = text.substr(at, hexadecimalEnd - at);
        if (run.size() >= fewestHexadecimal && std::ranges::any_of(run, isDigit) && !isAllDigits(run)) {
            result += _digits.hexadecimal(PseudonymKind::Hexadecimal, run);
            at = hexadecimalEnd;
        } else if (digits >= fewestDigits) {
            result += _digits.phone(text.substr(at, last - at));
            at = last;
        } else {
            // The rest of the run has been looked at; its digits are too few.
            end = std::max(last, at + 1);
            result += text.substr(at, end - at);
            at = end;
        }
    }
    return result;
}

} // namespace velmora

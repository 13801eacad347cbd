// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Positions/NMEASentence.h"

#include <algorithm>
#include <charconv>
#include <functional>
#include <numeric>

namespace velmora {

namespace {

constexpr std::size_t talkerLength = 2;
constexpr std::size_t kindLength = 3;

std::string_view trimmed(std::string_view text) {
    constexpr std::string_view space = " \t\r\n";
    const std::size_t begin = text.find_first_not_of(space);
    if (begin == std::string_view::npos)
        return {};
    return text.substr(begin, text.find_last_not_of(space) - begin + 1);
}

/// What lies between "$" and "*"; none where the two digits after it are not its checksum.
std::optional<std::string_view> checkedContent(std::string_view sentence) {
    if (sentence.size() > NMEASentence::maximumLength || !sentence.starts_with('$'))
        return std::nullopt;
    const std::size_t star = sentence.rfind('*');
    if (star == std::string_view::npos || sentence.size() - star != 3)
        return std::nullopt;
    unsigned checksum = 0;
    const char* const end = sentence.data() + sentence.size();
    const auto read = std::from_chars(sentence.data() + star + 1, end, checksum, 16);
    const std::string_view content = sentence.substr(1, star - 1);
    if (read.ptr != end || checksum != nmeaChecksum(content))
        return std::nullopt;
    return content;
}

} // namespace

unsigned nmeaChecksum(std::string_view content) {
    return std::transform_reduce(content.begin(), content.end(), 0U, std::bit_xor<>(),
                                 [](char each) { return static_cast<unsigned char>(each); });
}

std::optional<NMEASentence> NMEASentence::parse(std::string_view text) {
    std::optional<std::string_view> rest = checkedContent(trimmed(text));
    const auto isPrintable = [](char each) { return each >= 0x20 && each <= 0x7E; };
    if (!rest || !std::all_of(rest->begin(), rest->end(), isPrintable))
        return std::nullopt;
    NMEASentence sentence;
    const std::string_view address = rest->substr(0, rest->find(','));
    if (address.size() == talkerLength + kindLength && !address.starts_with('P'))
        sentence._kind = address.substr(talkerLength);
    while (rest->find(',') != std::string_view::npos) {
        if (sentence._count == maximumFields)
            return std::nullopt;
        rest->remove_prefix(rest->find(',') + 1);
        sentence._fields[sentence._count++] = rest->substr(0, rest->find(','));
    }
    return sentence;
}

} // namespace velmora

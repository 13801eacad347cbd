// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Samples/SampleText.h"

#include "Tools/Text/CSVText.h"

#include <charconv>

namespace velmora {

namespace {

constexpr std::size_t longestNumber = 32;

template <class Number>
void append(TextBuffer& out, Number number, int base) {
    char* const room = out.room(longestNumber);
    out.advance(static_cast<std::size_t>(std::to_chars(room, room + longestNumber, number, base).ptr - room));
}

} // namespace

void appendNumber(TextBuffer& out, double number) {
    char* const room = out.room(longestNumber);
    // Whole numbers are shown as such and not as 1e+06.
    constexpr double exact = 9007199254740992; // 2^53
    const bool isWhole =
        number > -exact && number < exact && number == static_cast<double>(static_cast<std::int64_t>(number));
    const auto result = isWhole ? std::to_chars(room, room + longestNumber, static_cast<std::int64_t>(number))
                                : std::to_chars(room, room + longestNumber, number);
    out.advance(static_cast<std::size_t>(result.ptr - room));
}

void appendNumber(TextBuffer& out, std::uint64_t number) {
    append(out, number, 10);
}

void appendCsvValue(TextBuffer& out, const Observation& observation, CSVGuard guard) {
    switch (observation.kind) {
    case ObservedKind::Number: appendNumber(out, observation.number); break;
    case ObservedKind::Enumeration: append(out, observation.raw, 10); break;
    case ObservedKind::Flag: out.append(observation.raw != 0 ? "true" : "false"); break;
    case ObservedKind::Text: appendCsvText(out, observation.words, guard); break;
    case ObservedKind::Binary: appendHexadecimal(out, observation.bytes); break;
    case ObservedKind::Absent: break;
    }
}

void appendHexadecimal(TextBuffer& out, Bytes bytes) {
    constexpr char digits[] = "0123456789abcdef";
    for (const std::uint8_t byte : bytes) {
        out.append(digits[byte >> 4]);
        out.append(digits[byte & 0xF]);
    }
}

std::string csvBeginning(const DecodeOptions& options) {
    return std::string("time") + (options.files.size() > 1 ? ",file" : "") +
           (options.hasTechnologyColumn ? ",technology" : "");
}

std::string csvCellOfFile(const std::string& file, CSVGuard guard) {
    if (file.empty())
        return {};
    TextBuffer cell;
    cell.append(',');
    appendCsvText(cell, file, guard);
    return std::string(cell.view());
}

void appendLogCode(TextBuffer& out, std::optional<std::uint32_t> code) {
    if (!code)
        return;
    out.append("0x");
    char text[16];
    char* const end = std::to_chars(text, text + sizeof text, *code, 16).ptr;
    for (auto missing = 4 - (end - text); missing > 0; --missing)
        out.append('0');
    for (const char* digit = text; digit != end; ++digit)
        out.append(static_cast<char>(*digit >= 'a' ? *digit - 'a' + 'A' : *digit));
}

} // namespace velmora

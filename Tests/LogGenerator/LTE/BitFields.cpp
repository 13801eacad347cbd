// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/LTE/BitFields.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <vector>

namespace velmora {

namespace {

enum class Content : std::uint8_t { Zero, One, Ones };

const char* textOf(const BitField& field, Content content) {
    switch (content) {
    case Content::Zero: return field.zero;
    case Content::One: return field.one;
    case Content::Ones: break;
    }
    return field.ones;
}

void put(std::vector<std::uint8_t>& bytes, const BitField& field, Content content) {
    for (unsigned i = 0; i < field.width; ++i) {
        const std::size_t at = field.byte * 8 + field.bit + i;
        const auto mask = static_cast<std::uint8_t>(1u << at % 8);
        const bool set = content == Content::Ones || (content == Content::One && i == 0);
        std::uint8_t& byte = bytes.at(at / 8);
        byte = static_cast<std::uint8_t>(set ? byte | mask : byte & ~mask);
    }
}

} // namespace

void expectBitFields(std::span<const BitField> table, std::size_t length,
                     const std::function<std::string(Bytes)>& show) {
    for (const Content filling : {Content::Zero, Content::Ones})
        for (const BitField& field : table)
            for (const Content content : {Content::Zero, Content::One, Content::Ones}) {
                std::vector<std::uint8_t> bytes(length, filling == Content::Ones ? 0xFF : 0x00);
                put(bytes, field, content);
                std::string expected;
                for (const BitField& each : table) {
                    const bool same = each.byte == field.byte && each.bit == field.bit;
                    expected.append(expected.empty() ? "{" : ", ").append(each.label).append(" '");
                    expected.append(textOf(each, same ? content : filling)).append("'");
                }
                expected.append("}");
                EXPECT_EQ(show(bytes), expected) << field.label << " of " << static_cast<int>(content)
                                                 << " in " << static_cast<int>(filling);
            }
}

} // namespace velmora

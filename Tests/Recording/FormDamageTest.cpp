// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Recording/LogFile.h"

#include <cstddef>
#include <string>
#include <vector>

#include <gtest/gtest.h>

// Files of each form with any one byte wrong, and cut off anywhere: a message or a counted loss, whatever it
// is. That reading ends is what these tests show by ending themselves.

namespace velmora {
namespace {

Data rawMessages() {
    return joined(stampedRecord(0x512C, "05000100", stampAfter(0)), hex("8171"),
                  stampedRecord(0x7132, "010000", stampAfter(1)),
                  stampedRecord(0x0002, "3C61727261792F3E", stampAfter(2), 0xFF), hex("01 1000 2C51"),
                  stampedRecord(0x5137, "00112233445566778899AABBCCDDEEFF", stampAfter(3), 2),
                  stampedRecord(0x512C, "04000100", stampAfter(4)));
}

Data log() {
    return joined(versionReport(), rawMessages().from(1), rawMessages().from(1));
}

Data snapshot(bool binary) {
    return snapshotFile({historyEntry(rawMessages(), "2026-11-16 05:00:02 +0000"),
                         historyEntry(rawMessages(), "2026-11-16 05:00:04 +0000")},
                        binary);
}

/// What is read is consistent: numbers ascend, times are present, and what is not read is reported.
void expectSound(const Data& file, const std::string& what) {
    const ReadOut out = readAnyForm(file);
    if (!out.failure.empty()) {
        EXPECT_TRUE(out.messages.empty()) << what;
        return;
    }
    std::uint64_t last = 0;
    std::size_t bytes = 0;
    for (const std::string& message : out.messages) {
        const std::uint64_t number = std::stoull(message);
        EXPECT_GT(number, last) << what;
        last = number;
        bytes += message.size();
    }
    EXPECT_LE(bytes, 10 * file.size() + 1000) << what;
}

class FormDamage : public testing::TestWithParam<Data (*)()> {};

TEST_P(FormDamage, anyByteWrong) {
    const Data file = GetParam()();
    std::vector<std::uint8_t> bytes(file.bytes().begin(), file.bytes().end());
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        const std::uint8_t good = bytes[i];
        for (const unsigned value : {0U, 0xFFU, good + 1U, good ^ 0x10U, good ^ 0x80U}) {
            bytes[i] = static_cast<std::uint8_t>(value);
            expectSound(Data::copyOf(bytes), std::to_string(i) + " is " + std::to_string(value));
        }
        bytes[i] = good;
    }
}

TEST_P(FormDamage, cutOffAnywhere) {
    const Data file = GetParam()();
    for (std::size_t size = 0; size <= file.size(); ++size)
        expectSound(Data::copyOf(file.bytes().first(size)), std::to_string(size) + " bytes");
}

INSTANTIATE_TEST_SUITE_P(Log, FormDamage, testing::Values(+[] { return log(); }));
INSTANTIATE_TEST_SUITE_P(XMLSnapshot, FormDamage, testing::Values(+[] { return snapshot(false); }));
INSTANTIATE_TEST_SUITE_P(BinarySnapshot, FormDamage, testing::Values(+[] { return snapshot(true); }));

/// One byte of the log wrong costs at most the record that it is in and one beside it.
TEST(LogDamage, costsNoMoreThanTheRecordsThatItTouches) {
    const Data file = log();
    const std::size_t whole = readAnyForm(file).messages.size();
    ASSERT_EQ(whole, 10u);
    std::vector<std::uint8_t> bytes(file.bytes().begin(), file.bytes().end());
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        for (unsigned bit = 0; bit < 8; ++bit) {
            bytes[i] = static_cast<std::uint8_t>(bytes[i] ^ 1U << bit);
            const ReadOut out = readAnyForm(Data::copyOf(bytes));
            EXPECT_EQ(out.failure, "") << i;
            EXPECT_GE(out.messages.size() + 2, whole) << i << " bit " << bit;
            EXPECT_TRUE(out.messages.size() >= whole || !out.losses.empty()) << i << " bit " << bit;
            bytes[i] = file.bytes()[i];
        }
    }
}

} // namespace
} // namespace velmora

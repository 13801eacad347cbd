// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/Sealing/MaskSeal.h"

#include "Tests/Export/Masking/ExampleKey.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

MaskSeal exampleSeal() {
    MessageDigest digest;
    return {MaskLevel::Location, exampleKey().fingerprint(), digest.text(), {}};
}

// SHA-256 of no message at all, as FIPS 180-4 has it.
constexpr std::string_view nothing = "e3b0c44298fc1c149afbf4c8996fb92427ae41e4649b934ca495991b7852b855";

TEST(MaskSealTest, IsReadAsItIsWritten) {
    const MaskSeal seal = exampleSeal();
    EXPECT_EQ(seal.text(), "velmora-mask 1 level=location key=0a236b28bb6d5db1805b6821a52e2cf7 messages=" +
                               std::string(nothing));
    EXPECT_EQ(MaskSeal::read(seal.text()), seal);
    EXPECT_EQ(MaskSeal::read(Bytes(seal.bytes())), seal);
    EXPECT_EQ(seal.bytes().size(), MaskSeal::reportLength);
}

TEST(MaskSealTest, MayLackTheDigest) {
    MaskSeal seal = exampleSeal();
    seal.digest.clear();
    EXPECT_EQ(MaskSeal::read(seal.text()), seal);
}

TEST(MaskSealTest, HasADigestOfPositions) {
    MaskSeal seal = exampleSeal();
    MessageDigest sentences;
    seal.positions = sentences.text();
    EXPECT_EQ(seal.text(), "velmora-mask 1 level=location key=0a236b28bb6d5db1805b6821a52e2cf7 messages=" +
                               std::string(nothing) + " positions=" + std::string(nothing));
    EXPECT_EQ(MaskSeal::read(seal.text()), seal);
    EXPECT_FALSE(MaskSeal::read(seal.text() + "0"));
    EXPECT_FALSE(MaskSeal::read(std::string_view(seal.text()).substr(0, 200)));
    seal.digest.clear();
    EXPECT_FALSE(MaskSeal::read(seal.text())) << "positions without messages";
    sentences.addSentence("$GPGGA");
    EXPECT_NE(sentences.text(), nothing);
}

TEST(MaskSealTest, OtherTextsAreNone) {
    const std::string text = exampleSeal().text();
    for (const std::string& other :
         {std::string(), std::string("a comment"), text.substr(1), text.substr(0, 50), text + "0",
          std::string("velmora-mask 1 level=none key=0a236b28bb6d5db1805b6821a52e2cf7"),
          std::string("velmora-mask 1 level=all key=0A236B28BB6D5DB1805B6821A52E2CF7")})
        EXPECT_FALSE(MaskSeal::read(other)) << other;
    std::vector<std::uint8_t> bytes = exampleSeal().bytes();
    bytes[7] = 3; // no level
    EXPECT_FALSE(MaskSeal::read(Bytes(bytes)));
    EXPECT_FALSE(MaskSeal::read(Bytes(bytes).first(20)));
}

TEST(MaskSealTest, DigestTellsMessagesApart) {
    const std::vector<std::uint8_t> bytes{1, 2, 3};
    MessageDigest one;
    one.add("IFX", Bytes(bytes).first(1));
    one.add("IFX", Bytes(bytes).subspan(1));
    MessageDigest other;
    other.add("IFX", Bytes(bytes).first(2));
    other.add("IFX", Bytes(bytes).subspan(2));
    EXPECT_NE(one.text(), other.text());
}

} // namespace
} // namespace velmora

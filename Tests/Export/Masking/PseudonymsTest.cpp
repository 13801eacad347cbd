// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Export/Masking/ExampleKey.h"

#include <gtest/gtest.h>

#include <set>

namespace velmora {
namespace {

class PseudonymsTest : public testing::Test {
protected:
    Pseudonyms _identities{exampleOptions()};
    Pseudonyms _locations{exampleOptions(MaskLevel::Location)};
};

Bytes bytesOf(std::string_view text) {
    return {reinterpret_cast<const std::uint8_t*>(text.data()), text.size()};
}

TEST_F(PseudonymsTest, HashIsThatOfRFC4231) {
    // Its second test case.
    EXPECT_EQ(hexadecimalText(KeyedHash(bytesOf("Jefe"))(bytesOf("what do ya want for nothing?"))),
              "5bdcc146bf60754e6a042426089575c75a003f089d2739839dec58b964ec3843");
}

TEST_F(PseudonymsTest, KeyIsReadAsItIsWritten) {
    const MaskKey key = exampleKey();
    EXPECT_EQ(key.text(), "000102030405060708090a0b0c0d0e0f101112131415161718191a1b1c1d1e1f");
    const Result<MaskKey> read = MaskKey::read(key.text() + "\n");
    ASSERT_TRUE(read);
    EXPECT_EQ(read->bytes, key.bytes);
    EXPECT_EQ(key.fingerprint(), "0a236b28bb6d5db1805b6821a52e2cf7");
}

TEST_F(PseudonymsTest, WhatIsNoKeyIsRefused) {
    EXPECT_EQ(MaskKey::read("00ff").reason(), "no key: 4 characters, wanted 64 hexadecimal digits");
    EXPECT_EQ(MaskKey::read(std::string(63, '0') + "g").reason(),
              "no key: character 64 is none, wanted 64 hexadecimal digits");
}

TEST_F(PseudonymsTest, DigitsAreThoseOfTheIndependentProgram) {
    DigitPseudonyms& digits = _identities.digits;
    EXPECT_EQ(digits.iccid("8900101000000000017"), "8912596966232995399");
    EXPECT_EQ(digits.imsi("001010000000017"), "001011950118174");
    EXPECT_EQ(digits.imsi("310410123456789"), "310410196357526");
    EXPECT_EQ(digits.eid("89001000000000000000000000000099"), "89366864005478571613715940785597");
    EXPECT_EQ(digits.equipment("001010999999990"), "414682044152432");
    EXPECT_EQ(digits.phone("15550100"), "24092455");
}

TEST_F(PseudonymsTest, GroupsOfDigitsStayWhereTheyAre) {
    EXPECT_EQ(_identities.digits.phone("+1 555 0100"), "+2 409 2455");
    EXPECT_EQ(_identities.digits.phone("+1-555-0100"), "+2-409-2455");
}

TEST_F(PseudonymsTest, NetworkOfAnIMSIIsMaskedWithTheLocation) {
    // 001 becomes 078 and 01 becomes 07, as in every other message.
    EXPECT_EQ(_locations.digits.imsi("001010000000017"), "078071950118174");
    EXPECT_EQ(_locations.digits.networkOfIMSI("001011950118174"), "078071950118174");
}

TEST_F(PseudonymsTest, ShortIMSIKeepsNothing) {
    EXPECT_NE(_identities.digits.imsi("00101"), "00101");
    EXPECT_EQ(_identities.digits.imsi("00101").size(), 5U);
}

TEST_F(PseudonymsTest, HexadecimalEquipmentStaysHexadecimalInItsCase) {
    const std::string masked = _identities.digits.equipment("A10000A1234567");
    EXPECT_EQ(masked.find_first_not_of("0123456789ABCDEF"), std::string::npos);
    EXPECT_EQ(masked.size(), 14U);
    EXPECT_NE(masked, "A10000A1234567");
}

TEST_F(PseudonymsTest, NumbersAreThoseOfTheIndependentProgram) {
    NumberPseudonyms& numbers = _locations.numbers;
    EXPECT_EQ(numbers.area(PseudonymKind::LocationArea, 4101, 16, 16), 44394U);
    EXPECT_EQ(numbers.area(PseudonymKind::LocationArea, 4101, 16, 40), 44394U); // as in a property list
    EXPECT_EQ(numbers.area(PseudonymKind::TrackingArea, 7101, 16, 16), 17202U);
    EXPECT_EQ(numbers.area(PseudonymKind::RoutingArea, 11, 8, 8), 220U);
    EXPECT_EQ(numbers.cell(CellIdentityForm::GSM, 4711, 16), 2195U);
    EXPECT_EQ(numbers.number(PseudonymKind::Temporary, 0x8EC7E8, 24, 24), 0x347D28U);
    EXPECT_EQ(numbers.countryCode(1), 78U);
    EXPECT_EQ(numbers.networkCode(1), 7U);
    EXPECT_EQ(numbers.networkCode(410), 697U);
}

TEST_F(PseudonymsTest, CellsOfOneSiteStayTogether) {
    NumberPseudonyms& numbers = _locations.numbers;
    EXPECT_EQ(numbers.cell(CellIdentityForm::LTE, 0x1234503, 32), 0xA88EA96U);
    EXPECT_EQ(numbers.cell(CellIdentityForm::LTE, 0x1234504, 32), 0xA88EAF6U);
}

TEST_F(PseudonymsTest, NumbersThatStandForNoneStay) {
    NumberPseudonyms& numbers = _locations.numbers;
    for (const std::uint64_t value : {0x0U, 0xFFFFU, 0xFFFEU, 0xFFFFFFFFU})
        EXPECT_EQ(numbers.area(PseudonymKind::LocationArea, value, 16, 32), value);
    for (const std::uint64_t value : {0x0U, 0xFFFFFFFU, 0xFFFFFFFFU})
        EXPECT_EQ(numbers.cell(CellIdentityForm::UMTS, value, 32), value);
}

TEST_F(PseudonymsTest, EveryNumberOfAWidthHasAPseudonymOfItsOwn) {
    std::set<std::uint64_t> areas;
    for (std::uint64_t code = 0; code < 0x10000; ++code)
        areas.insert(_locations.numbers.area(PseudonymKind::LocationArea, code, 16, 16));
    EXPECT_EQ(areas.size(), 0x10000U);
    EXPECT_EQ(*areas.rbegin(), 0xFFFFU);
    std::set<unsigned> networks;
    for (unsigned code = 0; code < 1000; ++code)
        networks.insert(_locations.numbers.networkCode(code));
    EXPECT_EQ(networks.size(), 1000U);
}

TEST_F(PseudonymsTest, AddressesAreThoseForDocuments) {
    const AddressPseudonyms& addresses = _identities.addresses;
    EXPECT_EQ(addresses.text("10.64.3.7"), "198.19.0.157");
    EXPECT_EQ(addresses.text("10.64.3.7/29"), "198.19.0.157/29");
    EXPECT_EQ(addresses.text("2001:db8::17"), "2001:db8:9afb:eb81:cbe0:ee8a:2f2c:3a8c");
    EXPECT_EQ(addresses.text("2001:DB8:0:0::0017"), "2001:db8:9afb:eb81:cbe0:ee8a:2f2c:3a8c");
    EXPECT_EQ(addresses.text("0.0.0.0"), "0.0.0.0");
    EXPECT_EQ(addresses.text("::"), "::");
    EXPECT_FALSE(addresses.text("internet.test"));
    EXPECT_FALSE(addresses.text("10.64.3.7 and more"));
    EXPECT_TRUE(isDocumentationAddress("198.51.100.9"));
    EXPECT_FALSE(isDocumentationAddress("198.51.101.9"));
    EXPECT_TRUE(isDocumentationAddress("198.18.0.1"));
    EXPECT_TRUE(isDocumentationAddress("198.19.255.254"));
    EXPECT_FALSE(isDocumentationAddress("198.17.255.254"));
    EXPECT_FALSE(isDocumentationAddress("198.20.0.1"));
}

TEST_F(PseudonymsTest, AddressesSeldomHaveTheSamePseudonym) {
    // Of 2000 drawn from 130,810 some 15 are expected twice: 2000 * 1999 / 2 / 130,810.
    std::set<std::string> pseudonyms;
    for (int i = 0; i < 2000; ++i) {
        const std::string text = *_identities.addresses.text("10.64." + std::to_string(i / 250) + "." +
                                                             std::to_string(1 + i % 250));
        EXPECT_TRUE(isDocumentationAddress(text)) << text;
        EXPECT_FALSE(text.ends_with(".0") || text.ends_with(".255")) << text;
        pseudonyms.insert(text);
    }
    EXPECT_GT(pseudonyms.size(), 1960U);
}

TEST_F(PseudonymsTest, CheckDigitIsThatOfTheStandard) {
    EXPECT_EQ(checkDigitOf("7992739871"), '3');     // the example of ISO/IEC 7812-1 annex B's method
    EXPECT_EQ(checkDigitOf("49015420323751"), '8'); // of 3GPP TS 23.003 annex B's method
}

} // namespace
} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Export/Masking/ExampleKey.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

class TextPseudonymsTest : public testing::Test {
protected:
    Pseudonyms _identities{exampleOptions()};
    Pseudonyms _locations{exampleOptions(MaskLevel::Location)};
    const TextPseudonyms& _texts = _identities.texts;
};

TEST_F(TextPseudonymsTest, DescriptionOfALocationKeepsItsWordsAndCodes) {
    EXPECT_EQ(_texts.personal("001-01, LAC 4101, updated"), "001-01, LAC 4101, updated");
    EXPECT_EQ(_texts.personal("001-01, LAC 4101, RAC 11, not updated"),
              "001-01, LAC 4101, RAC 11, not updated");
    EXPECT_EQ(_locations.texts.personal("001-01, LAC 4101, RAC 11, updated"),
              "078-07, LAC 44394, RAC 220, updated");
    EXPECT_EQ(_locations.texts.areas("001-01, LAC 4101, RAC 11, updated"),
              "078-07, LAC 44394, RAC 220, updated");
}

TEST_F(TextPseudonymsTest, WhatIsNotKnownInADescriptionIsReplaced) {
    const std::string masked = _texts.personal("TMSI 9F3A2B1C, LAC 4101, Erika, 4711");
    EXPECT_TRUE(masked.starts_with("TMSI "));
    EXPECT_EQ(masked.substr(13, 12), ", LAC 4101, ");
    EXPECT_EQ(masked.find("9F3A2B1C"), std::string::npos);
    EXPECT_EQ(masked.find("Erika"), std::string::npos);
    EXPECT_EQ(masked.find("4711"), std::string::npos);
}

TEST_F(TextPseudonymsTest, OrdinaryTextsStay) {
    for (const char* const text : {"", "-71 dBm", "7168 kbit/s", "Interactive", "01.02.03",
                                   "/sys/devices/pci0000:00/0000:00:14.0/usb2/2-1", "cdc-wdm0", "qmimux0",
                                   "1.20.4", "08:00:01", "GSM 900", "7-3", "001-01"})
        EXPECT_EQ(_texts.free(text), text);
}

TEST_F(TextPseudonymsTest, NumbersInATextAreReplaced) {
    EXPECT_EQ(_texts.free("call to +1 555 0100 failed"), "call to +2 409 2455 failed");
    EXPECT_EQ(_texts.free("(15550100)"), "(24092455)");
    EXPECT_EQ(_texts.free("from 10.64.3.7:80."), "from 198.19.0.157:80.");
    EXPECT_EQ(_texts.free("at 2001:db8::17."), "at 2001:db8:9afb:eb81:cbe0:ee8a:2f2c:3a8c.");
    EXPECT_EQ(_texts.free("wwx028037ec0200").find("028037ec0200"), std::string::npos);
    EXPECT_TRUE(_texts.free("wwx028037ec0200").starts_with("wwx"));
}

TEST_F(TextPseudonymsTest, NetworksAreReplacedInEveryForm) {
    EXPECT_EQ(_texts.network("00101"), "00101");
    EXPECT_EQ(_locations.texts.network("00101"), "07807");
    EXPECT_EQ(_locations.texts.network("001-01"), "078-07");
    EXPECT_EQ(_locations.texts.network("001/410"), "078/697");
    EXPECT_EQ(_locations.texts.network("001-01, 001-01"), "078-07, 078-07");
}

TEST_F(TextPseudonymsTest, CharactersOutsideASCIIDoNotStay) {
    EXPECT_EQ(_texts.scrambled("\u00E9\u00E9"), "xxxx");
}

TEST_F(TextPseudonymsTest, LettersBesideDigitsDoNotStay) {
    const std::string masked = _texts.letters("Erika 12345F");
    EXPECT_TRUE(masked.ends_with(" 12345F"));
    EXPECT_EQ(masked.find("Erika"), std::string::npos);
    EXPECT_EQ(_texts.letters("+1 555"), "+1 555");
}

} // namespace
} // namespace velmora

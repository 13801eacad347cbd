// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Fields/TextFields.h"

#include "Tests/Tools/Fields/ExampleCatalogue.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

TEST(TextFieldsTest, TablesOfTechnologiesHaveColumnsThatLineUp) {
    // The code that state and mode share is listed once.
    EXPECT_EQ(writtenBy<TextFields>(),
              "Ostrel_GSM\n"
              "  /Group/Cells/*/Level  number dBm     neighbour.level  0x5137, 0xFF0001\n"
              "  /Group/State          enumeration    radio.state      0x512C\n"
              "  /Group/Barred         flag                            0x512C\n"
              "  /Group/Network        text           serving.mnc      0x7135\n"
              "  /Group/Power          number dBm                      0xB17F\n"
              "  /Rate                 number kbit/s                   0xB17F\n"
              "  /Name                 text                            0xFF0000\n"
              "  /AGC                  number                          0x119C\n"
              "  /List                 absent\n"
              "\n"
              "IFX\n"
              "  /RxLev    number dBm  serving.level\n"
              "  /Na\u00EFve\\n  text\n");
}

TEST(TextFieldsTest, TechnologiesWithoutRowsAreLeftOut) {
    EXPECT_EQ(written([](Output& output) {
                  const ExampleTexts texts;
                  TextFields writer(output);
                  writer.write("Ostrel_GSM", {});
                  writer.write("IFX", texts.rows());
                  writer.write("Ostrel_LTE", {});
              }),
              "IFX\n"
              "  /RxLev    number dBm  serving.level\n"
              "  /Na\u00EFve\\n  text\n");
}

} // namespace
} // namespace velmora

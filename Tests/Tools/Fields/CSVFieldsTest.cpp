// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Fields/CSVFields.h"

#include "Tests/Tools/Fields/ExampleCatalogue.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

TEST(CSVFieldsTest, EachLeafIsARowWithItsSourcesSideBySide) {
    // Twelve cells of the leaf and fourteen of its sources, with a value for each source.
    EXPECT_EQ(writtenBy<CSVFields>(),
              "technology,path,section,kind,unit,role,identity,clause,keys,absent,same_as,read_from_text,"
              "code,place_offset,place_bit,place_width,place_signed,place_big_endian,place_in_entry,place_"
              "sub_packet,"
              "physical_scale,physical_offset,enumeration,digits,absent_value,only_absent\r\n"
              "Ostrel_GSM,/Group/Cells/*/Level,Cells,number,dBm,neighbour.level,,,ARFCN;BSIC,,,false,"
              "0x5137;0xFF0001,2;,0;,8;,false;,false;,true;,,-1;2,0;5,,,;-999,false;false\r\n"
              "Ostrel_GSM,/Group/State,Status,enumeration,,radio.state,,3GPP TS 24.008 4.1,,,,false,"
              "0x512C;0x512C,14;46,0;0,8;32,false;false,false;false,false;false,,,,"
              "\"1=Idle|7=Busy, \"\"really\"\"|*=[Reserved *];0=Automatic|*=Unknown\",,,false;true\r\n"
              "Ostrel_GSM,/Group/Barred,Status,flag,,,,,,,,false,"
              "0x512C,25,3,1,false,false,false,,,,0=Allowed|*=Barred,,,false\r\n"
              "Ostrel_GSM,/Group/Network,Status,text,,serving.mnc,location,3GPP TS 23.003 2.2,,N/A,,false,"
              "0x7135,20,0,16,false,true,false,,,,,2,,false\r\n"
              "Ostrel_GSM,/Group/Power,Status,number,dBm,,,,,,,false,"
              "0xB17F,21,0,9,true,false,false,,0.25,-140,,,,false\r\n"
              "Ostrel_GSM,/Rate,Status,number,kbit/s,,,,,,/Group/Power,false,"
              "0xB17F,30,0,32,true,false,false,,1.024,0,,,,false\r\n"
              "Ostrel_GSM,/Name,SIM Info,text,,,subscriber,,,,,false,0xFF0000,,,,,,,,,,,,,false\r\n"
              "Ostrel_GSM,/AGC,,number,,,,,,,,false,0x119C,10,0,16,false,false,false,2,1,0,,,,false\r\n"
              "Ostrel_GSM,/List,,absent,,,,,,;(none),,false,,,,,,,,,,,,,,\r\n"
              "IFX,/RxLev,,number,dBm,serving.level,,,,,,true,,,,,,,,,,,,,,\r\n"
              "IFX,\"/Na\u00EFve\n\",,text,,,subscriber,,,,,false,,,,,,,,,,,,,,\r\n");
}

} // namespace
} // namespace velmora

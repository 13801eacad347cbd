// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Fields/JSONFields.h"

#include "Tests/Tools/Fields/ExampleCatalogue.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

TEST(JSONFieldsTest, OneObjectHoldsARowALine) {
    // Level: -raw, and (raw * 2 + 5) dBm. Power: nine bits from bit 0 on, signed although shown as unsigned.
    // Rate: 32 bits, which "%d" shows with a sign whatever the place says; a kilobit of the display is 1.024
    // of 1000 bits.
    EXPECT_EQ(
        writtenBy<JSONFields>(),
        "{\n\"fields\": [\n"
        R"({"technology":"Ostrel_GSM","path":"/Group/Cells/*/Level","section":"Cells","kind":"number","unit":"dBm",)"
        R"("role":"neighbour.level","keys":["ARFCN","BSIC"],"absent":[""],"sources":[)"
        R"({"code":20791,"place":{"offset":2,"bit":0,"width":8,"signed":false,"bigEndian":false,"inEntry":true},)"
        R"("physical":{"scale":-1,"offset":0}},)"
        R"({"code":16711681,"physical":{"scale":2,"offset":5},"absent":{"value":-999,"text":""}}]},)"
        "\n"
        R"({"technology":"Ostrel_GSM","path":"/Group/State","section":"Status","kind":"enumeration",)"
        R"("role":"radio.state","clause":"3GPP TS 24.008 4.1","sources":[)"
        R"({"code":20780,"place":{"offset":14,"bit":0,"width":8,"signed":false,"bigEndian":false,"inEntry":false},)"
        R"("values":[{"value":1,"text":"Idle"},{"value":7,"text":"Busy, \"really\""}],)"
        R"("others":{"before":"[Reserved ","after":"]"}},)"
        R"({"code":20780,"place":{"offset":46,"bit":0,"width":32,"signed":false,"bigEndian":false,"inEntry":false},)"
        R"("values":[{"value":0,"text":"Automatic"}],"others":{"text":"Unknown"},"onlyAbsent":true}]},)"
        "\n"
        R"({"technology":"Ostrel_GSM","path":"/Group/Barred","section":"Status","kind":"flag","sources":[)"
        R"({"code":20780,"place":{"offset":25,"bit":3,"width":1,"signed":false,"bigEndian":false,"inEntry":false},)"
        R"("values":[{"value":0,"text":"Allowed"}],"others":{"text":"Barred"}}]},)"
        "\n"
        R"({"technology":"Ostrel_GSM","path":"/Group/Network","section":"Status","kind":"text",)"
        R"("role":"serving.mnc","identity":"location","clause":"3GPP TS 23.003 2.2","absent":["N/A"],"sources":[)"
        R"({"code":28981,"place":{"offset":20,"bit":0,"width":16,"signed":false,"bigEndian":true,"inEntry":false},)"
        R"("digits":2}]},)"
        "\n"
        R"({"technology":"Ostrel_GSM","path":"/Group/Power","section":"Status","kind":"number","unit":"dBm","sources":[)"
        R"({"code":45439,"place":{"offset":21,"bit":0,"width":9,"signed":true,"bigEndian":false,"inEntry":false},)"
        R"("physical":{"scale":0.25,"offset":-140}}]},)"
        "\n"
        R"({"technology":"Ostrel_GSM","path":"/Rate","section":"Status","kind":"number","unit":"kbit/s",)"
        R"("sameAs":"/Group/Power","sources":[)"
        R"({"code":45439,"place":{"offset":30,"bit":0,"width":32,"signed":true,"bigEndian":false,"inEntry":false},)"
        R"("physical":{"scale":1.024,"offset":0}}]},)"
        "\n"
        R"({"technology":"Ostrel_GSM","path":"/Name","section":"SIM Info","kind":"text","identity":"subscriber",)"
        R"("sources":[{"code":16711680}]},)"
        "\n"
        R"({"technology":"Ostrel_GSM","path":"/AGC","kind":"number","sources":[)"
        R"({"code":4508,"place":{"offset":10,"bit":0,"width":16,"signed":false,"bigEndian":false,"inEntry":false,)"
        R"("subPacket":2},"physical":{"scale":1,"offset":0}}]},)"
        "\n"
        R"-({"technology":"Ostrel_GSM","path":"/List","kind":"absent","absent":["","(none)"],"sources":[]},)-"
        "\n"
        R"({"technology":"IFX","path":"/RxLev","kind":"number","unit":"dBm","role":"serving.level",)"
        R"("readFromText":true,"sources":[]},)"
        "\n"
        R"({"technology":"IFX","path":"/Na)"
        "\u00EFve"
        R"(\n","kind":"text","identity":"subscriber","sources":[]})"
        "\n]\n}\n");
}

TEST(JSONFieldsTest, NoRowsAreAnEmptyList) {
    EXPECT_EQ(written([](Output& output) {
                  JSONFields writer(output);
                  writer.begin();
                  writer.write("IFX", {});
                  writer.end();
              }),
              "{\n\"fields\": [\n]\n}\n");
}

} // namespace
} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Fields/Role.h"
#include "LogGenerator/Fields/Unit.h"
#include "Platform/TelephonyService.h"
#include "Tests/Support/ShippedResources.h"
#include "Tests/Tools/CheckedJSON.h"
#include "Tests/Tools/Fields/ExampleCatalogue.h"
#include "Tests/Tools/ToolFixture.h"
#include "Tools/Fields/JSONFields.h"

#include <gmock/gmock.h>
#include <nlohmann/json.hpp>

#include <string>

// The JSON of velmora-log fields against the schema that is published.

namespace velmora {
namespace {

constexpr const char* schemaFile = "velmora-log-fields.schema.json";

class FieldsSchemaTest : public ToolTest {};

TEST_F(FieldsSchemaTest, WholeCatalogueConforms) {
    ToolProcess::Setup setup = tool({"fields", "--format", "json"});
    setup.environment["VELMORA_RESOURCES"] = VELMORA_SOURCE_DIR "/Resources";
    ToolProcess process(setup);
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_EQ(checkJSON(schemaFile, process.output()), "1\n");
}

TEST_F(FieldsSchemaTest, RowsOfEachKindConform) {
    EXPECT_EQ(checkJSON(schemaFile, writtenBy<JSONFields>()), "1\n");
}

TEST_F(FieldsSchemaTest, CheckerFindsWhatIsWrong) {
    // So that the tests above can fail.
    const std::string good = R"({"technology":"IFX","path":"/A","kind":"text","sources":[{"code":1}]})";
    EXPECT_EQ(checkJSON(schemaFile, R"({"fields":[)" + good + "]}\n"), "1\n");
    for (const char* const bad : {
             R"({"path":"/A","kind":"text","sources":[]})",                                 // no technology
             R"({"technology":"IFX","path":"A","kind":"text","sources":[]})",               // no path
             R"({"technology":"IFX","path":"/A","kind":"real","sources":[]})",              // no kind
             R"({"technology":"IFX","path":"/A","kind":"number","unit":"","sources":[]})",  // no unit
             R"({"technology":"IFX","path":"/A","kind":"number","role":"x","sources":[]})", // no role
             R"({"technology":"IFX","path":"/A","kind":"text","sources":[{"code":0}]})",    // no code
             R"({"technology":"IFX","path":"/A","kind":"text","sources":[{"code":1,"place":{"offset":1}}]})",
             R"({"technology":"IFX","path":"/A","kind":"flag","sources":[{"code":1,"values":[]}]})", // no
                                                                                                     // others
             R"({"technology":"IFX","path":"/A","kind":"text","sources":[],"more":1})",
         })
        EXPECT_THAT(checkJSON(schemaFile, R"({"fields":[)" + std::string(bad) + "]}\n"),
                    testing::StartsWith("status"))
            << bad;
}

/// The values of a property of a row in the schema.
std::vector<std::string> listed(const char* property) {
    const Data file = shippedResource(schemaFile);
    const nlohmann::json schema = nlohmann::json::parse(file.bytes().begin(), file.bytes().end());
    return schema.at("$defs").at("field").at("properties").at(property).at("enum");
}

TEST_F(FieldsSchemaTest, ListsEachRoleUnitAndTechnology) {
    std::vector<std::string> roles;
    for (const RoleName& row : roleNames())
        roles.emplace_back(row.name);
    EXPECT_EQ(listed("role"), roles);
    std::vector<std::string> units;
    for (const Unit unit : {Unit::DBm, Unit::DB, Unit::Percent, Unit::KilobitPerSecond, Unit::Second,
                            Unit::Megahertz, Unit::Byte, Unit::Degree, Unit::Metre})
        units.emplace_back(nameOf(unit));
    EXPECT_EQ(listed("unit"), units);
    std::vector<std::string> technologies;
    for (const std::string_view technology : voxTechnologies)
        technologies.emplace_back(shortTechnologyName(technology));
    EXPECT_EQ(listed("technology"), technologies);
}

} // namespace
} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/PropertyLists/PropertyKeys.h"
#include "LogGenerator/Observations/Catalogue.h"
#include "LogMessages/LiveModem.h"
#include "Tests/LogGenerator/Observations/DecodedTechnology.h"

#include <gtest/gtest.h>

#include <fstream>
#include <regex>
#include <set>
#include <string>

// Each table of keys against what else lists these keys, so that a new one is not forgotten.

namespace velmora {
namespace {

std::set<std::string> keysIn(const char* path) {
    std::ifstream file(std::string(VELMORA_SOURCE_DIR) + "/" + path);
    const std::string text((std::istreambuf_iterator<char>(file)), {});
    const std::regex literal("\"(k(?:Vox|SimFile_)\\w+)\"");
    std::set<std::string> keys;
    for (std::sregex_iterator each(text.begin(), text.end(), literal), end; each != end; ++each)
        keys.insert((*each)[1]);
    return keys;
}

TEST(CatalogueCoverageTest, EveryKeyOfALiveModemHasAForm) {
    for (const std::string& key : keysIn("LogMessages/LiveModem.h"))
        if (!key.starts_with("kVoxCellMonitorRadioAccessTechnology")) { // which is a value
            EXPECT_TRUE(formOf(PropertyListKind::Modem, key)) << key;
        }
}

TEST(CatalogueCoverageTest, EverySIMFileHasAForm) {
    const std::set<std::string> keys = keysIn("LogGenerator/Extra/SimInfo.cpp");
    EXPECT_EQ(keys.size(), 14U);
    for (const std::string& key : keys)
        EXPECT_TRUE(formOf(PropertyListKind::SIMFiles, key)) << key;
}

TEST(CatalogueCoverageTest, EveryKnownLeafOfADisplayHasAForm) {
    TechnologyUnderTest tested(decodedTechnologies[4]);
    for (const CatalogueField& leaf : tested.decoder().catalogue().fields())
        for (const CatalogueNode* node = leaf.node; node && !node->name().empty(); node = node->parent())
            if (!node->isRow()) {
                EXPECT_TRUE(formOf(PropertyListKind::Display, node->name())) << leaf.path;
            }
}

TEST(CatalogueCoverageTest, LeavesThatIdentifyHaveAFormThatIsMasked) {
    TechnologyUnderTest tested(decodedTechnologies[4]);
    for (const CatalogueField& leaf : tested.decoder().catalogue().fields())
        if (leaf.identity != Identity::None && !leaf.node->isRow()) {
            const auto form = formOf(PropertyListKind::Display, leaf.node->name());
            ASSERT_TRUE(form) << leaf.path;
            EXPECT_NE(*form, PropertyForm::Text) << leaf.path;
            EXPECT_NE(*form, PropertyForm::Number) << leaf.path;
        }
}

} // namespace
} // namespace velmora

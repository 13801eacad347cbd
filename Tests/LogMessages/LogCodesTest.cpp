// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/LogCodes.h"

#include "LogGenerator/LogGenerator.h"
#include "Platform/TelephonyService.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeResources.h"

#include <cstdint>
#include <set>
#include <string>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

/// The codes that the technology's decoder asks the telephony service for.
std::set<std::uint32_t> wantedCodes(std::string_view technology) {
    const FakeClock clock;
    FakeResources resources; // in which UTRAN's template is looked for by its name
    resources.put("Ostrel_UTRAN", "plist", makeDictionary());
    const auto decoder = LogGenerator::generatorFromTechnology(technologyConstant(technology), clock);
    const DictionaryRef command = decoder->getStartCommand();
    std::set<std::uint32_t> codes;
    if (const Array* list = (*command)[vox::setOstrelLogCodesKey].asArray())
        for (const Value& code : *list)
            codes.insert(static_cast<std::uint32_t>(*code.asInteger()));
    if (const Array* list = (*command)[vox::setVoxExtraCodesKey].asArray())
        for (const Value& code : *list)
            codes.insert(0xFF0000 + static_cast<std::uint32_t>(*code.asInteger()));
    return codes;
}

TEST(LogCodesTest, areThoseThatTheDecodersWant) {
    for (unsigned bit = 0; bit < technologyBits; ++bit) {
        const std::set<std::uint32_t> wanted = wantedCodes(technologyOfBit(bit));
        EXPECT_GE(wanted.size(), 8u);
        for (std::uint32_t code = 0; code <= 0xFFFFFF; ++code) {
            if (code == 0x10000)
                code = 0xFF0000; // no code lies between
            ASSERT_EQ((technologiesOfCode(code) >> bit & 1) != 0, wanted.contains(code))
                << technologyOfBit(bit) << " 0x" << std::hex << code;
        }
    }
}

TEST(LogCodesTest, knowEveryBinaryTechnology) {
    std::set<std::string_view> names{"IFX"};
    for (unsigned bit = 0; bit < technologyBits; ++bit)
        EXPECT_TRUE(names.insert(technologyOfBit(bit)).second);
    std::set<std::string_view> all;
    for (const std::string_view technology : voxTechnologies)
        all.insert(shortTechnologyName(technology));
    EXPECT_EQ(names, all);
}

} // namespace
} // namespace velmora

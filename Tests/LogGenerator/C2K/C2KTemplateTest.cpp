// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/C2KLogGenerator.h"
#include "PropertyLists/PropertyList.h"
#include "Tests/LogGenerator/C2K/ParserHarness.h"
#include "Tests/Support/ShippedResources.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <functional>
#include <set>
#include <stdexcept>

namespace velmora {
namespace {

/// The display template that is shipped.
const Dictionary& shippedTemplate() {
    static const Value root = [] {
        const Result<Value> read = readPropertyList(shippedResource("C2KTemplate.plist").bytes());
        if (!read)
            throw std::runtime_error(read.reason());
        return *read;
    }();
    return *root.asDictionary();
}

void walk(const Dictionary& level,
          const std::function<void(const std::string& label, const Value& value)>& look) {
    for (const auto& [label, value] : level) {
        look(label, value);
        if (const Dictionary* screen = value.asDictionary())
            walk(*screen, look);
    }
}

TEST(C2KTemplateTest, ShowsEveryValueKeyAndNothingElse) {
    std::set<std::string> named;
    walk(shippedTemplate(), [&](const std::string& label, const Value& value) {
        ASSERT_TRUE(value.asString() || value.asDictionary()) << label;
        if (value.asString())
            named.insert(*value.asString());
    });
    named.erase("_sorted");
    EXPECT_EQ(named, std::set<std::string>(valueKeys().begin(), valueKeys().end()));
}

TEST(C2KTemplateTest, MarkersHaveTheirOwnKey) {
    walk(shippedTemplate(), [](const std::string& label, const Value& value) {
        EXPECT_EQ(label == "_sorted", value == Value("_sorted")) << label;
    });
}

TEST(C2KTemplateTest, NoScreenIsEmptyAndNoneShowsAValueTwice) {
    const std::function<void(const Dictionary&)> check = [&check](const Dictionary& screen) {
        EXPECT_FALSE(screen.empty());
        std::set<std::string> seen;
        for (const auto& [label, value] : screen) {
            if (value.asString()) {
                EXPECT_TRUE(seen.insert(*value.asString()).second) << label;
            }
            if (const Dictionary* inner = value.asDictionary())
                check(*inner);
        }
    };
    check(shippedTemplate());
}

} // namespace
} // namespace velmora

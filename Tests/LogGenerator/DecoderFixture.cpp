// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/DecoderFixture.h"

#include "Tests/Support/ShippedResources.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <cstdio>

namespace velmora {

namespace {

std::vector<std::int64_t> ascending(const Value& list) {
    std::vector<std::int64_t> numbers;
    for (const Value& number : *list.asArray())
        numbers.push_back(*number.asInteger());
    std::sort(numbers.begin(), numbers.end());
    return numbers;
}

} // namespace

DecoderFixture::DecoderFixture(std::string_view templateName, std::string_view technology) {
    resources.put(templateName, "plist", shippedResource(std::string(templateName).append(".plist")));
    generator = LogGenerator::generatorFromTechnology(technology, clock);
    generator->updateState(state, recordWith(0x0001, 13));
}

LogLines DecoderFixture::update(const Data& record) {
    CapturedLog log;
    generator->updateState(state, record);
    return log.lines();
}

std::string DecoderFixture::node(std::string_view group, std::string_view section) {
    return shown((*(*generator->display(state).asDictionary())[group].asDictionary())[section]);
}

void DecoderFixture::expectStartCommand(const std::vector<std::int64_t>& codes) const {
    const DictionaryRef command = generator->getStartCommand();
    EXPECT_EQ(command->size(), 3u);
    EXPECT_EQ((*command)["SetState"], Value("Streaming"));
    EXPECT_EQ(ascending((*command)["SetOstrelLogCodes"]), codes);
    EXPECT_THAT(ascending((*command)["SetVoxExtraCodes"]), ::testing::ElementsAre(0, 1, 2));
}

LogLines DecoderFixture::destructionLines(std::initializer_list<const char*> names, const void* decoder) {
    char address[40];
    std::snprintf(address, sizeof address, "%p", decoder);
    LogLines lines;
    for (const char* name : names)
        lines.push_back({LogPriority::Warning, std::string(name) + " is destructed " + address});
    return lines;
}

LogLines traces(std::initializer_list<const char*> words) {
    LogLines lines;
    for (const char* word : words)
        lines.push_back({LogPriority::Warning, word});
    return lines;
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/DecoderFixture.h"

#include "Tests/Support/ShippedResources.h"

namespace velmora {

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
    const Value display = generator->display(state);
    const Value& place = group.empty() ? display : (*display.asDictionary())[group];
    return shown((*place.asDictionary())[section]);
}

} // namespace velmora

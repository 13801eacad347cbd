// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/Decoders/DecoderSession.h"

#include "LogGenerator/Extra/ExtraPayload.h"
#include "LogGenerator/GSM/AssertionFailure.h"
#include "Tests/Support/ShippedResources.h"

namespace velmora {

namespace {

Data templateFile(std::string_view templateName) {
    return shippedResource(std::string(templateName).append(".plist"));
}

} // namespace

ShippedTemplates::ShippedTemplates() {
    for (const FuzzedTechnology& technology : fuzzedTechnologies)
        if (!technology.templateName.empty())
            _resources.put(technology.templateName, "plist", templateFile(technology.templateName));
}

Value ShippedTemplates::read(std::string_view templateName) {
    return *readPropertyList(templateFile(templateName).bytes());
}

DecoderMaker::DecoderMaker(const FuzzedTechnology& technology) : _technology(technology.constant) {
    if (!technology.templateName.empty())
        _template = ShippedTemplates::read(technology.templateName);
}

DictionaryRef DecoderMaker::newState() const {
    DictionaryRef state = makeDictionary();
    if (!_template.isNone())
        state->set("Template", _template);
    return state;
}

std::unique_ptr<LogGenerator> DecoderMaker::newDecoder() const {
    return LogGenerator::generatorFromTechnology(_technology, _clock);
}

bool updateDecoder(LogGenerator& decoder, Dictionary& state, const Data& message) {
    try {
        decoder.updateState(state, message);
        return true;
    } catch (const LogCode_0xFF0000::UnknownDataException&) {
        return false;
    } catch (const AssertionFailure&) {
        return false;
    }
}

void DecoderSession::redraw() {
    static_cast<void>(_decoder->generateLogUsingState(*_state));
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/Decoders/DecoderSession.h"
#include "Fuzz/DriveMessages.h"
#include "Fuzz/FuzzTargets.h"
#include "Model/VelmoraModelNode.h"
#include "PropertyLists/PropertyList.h"

#include <array>
#include <string>

namespace velmora {

namespace {

/// The input's first byte chooses a technology that has a template, the rest is that template's resource. A
/// decoder goes through a drive with it, is drawn, and is taken over from by another.
class TemplateTarget final : public FuzzTarget {
public:
    TemplateTarget() {
        for (std::size_t i = 0; i < binaryTechnologies; ++i)
            _drives[i] = driveMessages(fuzzedTechnologies[i].scenario, std::chrono::seconds(60), 1);
    }

    void run(Bytes input) override {
        if (input.empty())
            return;
        const std::size_t choice = input.front() % binaryTechnologies;
        const FuzzedTechnology& technology = fuzzedTechnologies[choice];
        FakeResources resources;
        resources.put(technology.templateName, "plist", Data::copyOf(input.subspan(1)));

        Dictionary state;
        const std::string name(technology.constant);
        auto decoder = LogGenerator::generatorFromTechnology(name, _clock);
        for (const Data& message : _drives[choice])
            decoder->updateState(state, message);
        draw(*decoder, state);
        decoder = LogGenerator::generatorFromTechnology(name, _clock);
        decoder->updateState(state, _drives[choice].front());
        draw(*decoder, state);
    }

private:
    static void draw(LogGenerator& decoder, Dictionary& state) {
        const Value display = decoder.generateLogUsingState(state);
        require(display.isNone() || display.asDictionary() != nullptr, "a display is a dictionary");
        PathDictionary paths;
        const NodeRef root = VelmoraModelNode::makeTreeFromObject(display, paths);
        require(root && paths.contains("/"), "there is a tree for every display");
        require(!decoder.getSaveContentsFromState(state)->empty(), "there is always something to save");
    }

    FakeClock _clock;
    std::array<std::vector<Data>, binaryTechnologies> _drives;
};

} // namespace

std::unique_ptr<FuzzTarget> makeTemplateTarget() {
    return std::make_unique<TemplateTarget>();
}

} // namespace velmora

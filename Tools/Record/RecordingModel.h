// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Model/VelmoraModel.h"

#include <functional>
#include <memory>
#include <string_view>
#include <utility>

namespace velmora {

/// A model that passes the messages on instead of decoding them. Of its decoder it uses the start command
/// alone.
class RecordingModel final : public VelmoraModel {
public:
    struct Events {
        std::function<void(const Data& message)> message;
        /// Returns whether to record messages of this technology.
        std::function<bool(std::string_view technology, bool hasDecoder)> technology;
    };

    RecordingModel(ModelPlatform platform, Events events)
        : VelmoraModel(std::move(platform), nullptr), _events(std::move(events)) {}

    void updateWithData(const Data& data) override { _events.message(data); }

protected:
    [[nodiscard]] std::unique_ptr<LogGenerator>
    generatorFromTechnology(std::string_view technology) override {
        std::unique_ptr<LogGenerator> decoder = VelmoraModel::generatorFromTechnology(technology);
        const bool wanted = _events.technology(technology, decoder != nullptr);
        return wanted ? std::move(decoder) : nullptr;
    }

private:
    Events _events;
};

} // namespace velmora

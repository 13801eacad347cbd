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
        /// The connection is about to be made, for the first time or again.
        std::function<void()> connecting;
        std::function<void(const Data& message)> message;
        /// The service's source has no more messages.
        std::function<void()> sourceEnded;
        /// Returns whether to record messages of this technology.
        std::function<bool(std::string_view technology, bool hasDecoder)> technology;
    };

    RecordingModel(ModelPlatform platform, Events events)
        : VelmoraModel(announcing(std::move(platform), events.connecting), nullptr),
          _events(std::move(events)) {}

    void updateWithData(const Data& data) override { _events.message(data); }
    void takeOtherMessage(std::int32_t messageId) override {
        if (messageId == vox::sourceEndedMessage)
            _events.sourceEnded();
    }

protected:
    [[nodiscard]] std::unique_ptr<LogGenerator>
    generatorFromTechnology(std::string_view technology) override {
        std::unique_ptr<LogGenerator> decoder = VelmoraModel::generatorFromTechnology(technology);
        const bool wanted = _events.technology(technology, decoder != nullptr);
        return wanted ? std::move(decoder) : nullptr;
    }

private:
    /// The local port's name is built afresh for every connection.
    static ModelPlatform announcing(ModelPlatform platform, std::function<void()> connecting) {
        platform.portName = [connecting = std::move(connecting), name = std::move(platform.portName)] {
            connecting();
            return name();
        };
        return platform;
    }

    Events _events;
};

} // namespace velmora

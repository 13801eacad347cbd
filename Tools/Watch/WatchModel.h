// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Model/VelmoraModel.h"
#include "Tools/Log/DecoderLog.h"

#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <utility>

namespace velmora {

/// A model that reports the technology that the service names. A model's display is that of the first
/// technology and stays so; another technology takes another model.
class WatchModel final : public VelmoraModel {
public:
    struct Events {
        std::function<void(std::string_view technology)> changed;
        /// The technology of the messages that follow; may be null.
        std::function<void(std::string_view technology)> technology = {};
        std::function<void(const Data& message)> message = {}; ///< may be null
    };

    WatchModel(ModelPlatform platform, ModelObserver* observer, DecoderLines& lines, Events events)
        : VelmoraModel(std::move(platform), observer), _lines(lines), _events(std::move(events)) {}

    void updateWithData(const Data& data) override {
        const DecoderLog log(_lines);
        VelmoraModel::updateWithData(data);
        if (_events.message)
            _events.message(data);
    }

protected:
    [[nodiscard]] std::unique_ptr<LogGenerator>
    generatorFromTechnology(std::string_view technology) override {
        if (!_technology.empty() && _technology != technology)
            _events.changed(technology);
        _technology = technology;
        const DecoderLog log(_lines);
        if (_events.technology)
            _events.technology(technology);
        std::unique_ptr<LogGenerator> decoder = VelmoraModel::generatorFromTechnology(technology);
        // It is for snapshots, which are not made here, and holds the messages of five refreshes.
        if (decoder)
            decoder->setKeepsHistory(false);
        return decoder;
    }

private:
    DecoderLines& _lines;
    Events _events;
    std::string _technology;
};

} // namespace velmora

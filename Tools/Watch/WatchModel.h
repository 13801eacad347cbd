// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/MessageMask.h"
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

    /// `mask` may be null, for messages as they are; it must outlive the model.
    WatchModel(const ModelPlatform& platform, ModelObserver* observer, DecoderLines& lines, Events events,
               MessageMask* mask = nullptr)
        : VelmoraModel(platform, observer), _clock(platform.clock), _lines(lines), _events(std::move(events)),
          _mask(mask) {}

    void updateWithData(const Data& data) override {
        const DecoderLog log(_lines);
        if (!_mask)
            return take(data);
        LoggedMessage message;
        message.time = _clock.now();
        message.message = data;
        if (const auto masked = _mask->mask(std::move(message), shortTechnologyName(_technology)))
            take(masked->message);
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
    /// The message, masked where it is to be.
    void take(const Data& data) {
        VelmoraModel::updateWithData(data);
        if (_events.message)
            _events.message(data);
    }

    const Clock& _clock;
    DecoderLines& _lines;
    Events _events;
    MessageMask* _mask;
    std::string _technology;
};

} // namespace velmora

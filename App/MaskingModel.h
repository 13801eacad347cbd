// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Model/VelmoraModel.h"

#include <functional>
#include <utility>

namespace velmora {

class PrivacySwitch;

/// A model whose messages go through the privacy switch before they are decoded.
class MaskingModel final : public VelmoraModel {
public:
    /// `privacy` must outlive it.
    MaskingModel(const ModelPlatform& platform, ModelObserver* observer, PrivacySwitch& privacy)
        : VelmoraModel(platform, observer), _clock(platform.clock), _privacy(privacy) {}

    void updateWithData(const Data& data) override;
    /// Gets each message as it is shown, before it is decoded.
    void setOnShown(std::function<void(const Data& message)> onShown) { _onShown = std::move(onShown); }

private:
    const Clock& _clock;
    PrivacySwitch& _privacy;
    std::function<void(const Data& message)> _onShown;
};

} // namespace velmora

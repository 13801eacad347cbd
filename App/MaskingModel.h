// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Model/VelmoraModel.h"

namespace velmora {

class PrivacySwitch;

/// A model whose messages go through the privacy switch before they are decoded.
class MaskingModel final : public VelmoraModel {
public:
    /// `privacy` must outlive it.
    MaskingModel(const ModelPlatform& platform, ModelObserver* observer, PrivacySwitch& privacy)
        : VelmoraModel(platform, observer), _clock(platform.clock), _privacy(privacy) {}

    void updateWithData(const Data& data) override;

private:
    const Clock& _clock;
    PrivacySwitch& _privacy;
};

} // namespace velmora

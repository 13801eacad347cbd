// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Model/VelmoraModel.h"

#include <functional>
#include <utility>

namespace velmora {

class DriveModel;
class PrivacySwitch;

/// A model whose messages go through the privacy switch before they are decoded, for the panes and the drive
/// view alike.
class MaskingModel final : public VelmoraModel {
public:
    /// `privacy` must outlive it.
    MaskingModel(const ModelPlatform& platform, ModelObserver* observer, PrivacySwitch& privacy)
        : VelmoraModel(platform, observer), _clock(platform.clock), _privacy(privacy) {}

    /// The drive model gets the observations of whatever decoder there is; it must live for as long as
    /// messages arrive. Null for none.
    void setDrive(DriveModel* drive);

    void updateWithData(const Data& data) override;
    /// Gets each message as it is shown, before it is decoded.
    void setOnShown(std::function<void(const Data& message)> onShown) { _onShown = std::move(onShown); }

protected:
    void decoderWillChange(LogGenerator* next) override;

private:
    LogGenerator* _decoder = nullptr;
    DriveModel* _drive = nullptr;
    const Clock& _clock;
    PrivacySwitch& _privacy;
    std::function<void(const Data& message)> _onShown;
};

} // namespace velmora

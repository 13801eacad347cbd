// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/MaskingModel.h"

#include "Analysis/Drive/DriveModel.h"
#include "App/PrivacySwitch.h"

namespace velmora {

void MaskingModel::setDrive(DriveModel* drive) {
    if (_drive)
        _drive->setDecoder(nullptr);
    _drive = drive;
    if (_drive)
        _drive->setDecoder(_decoder);
}

void MaskingModel::decoderWillChange(LogGenerator* next) {
    _decoder = next;
    if (_drive)
        _drive->setDecoder(next);
}

void MaskingModel::updateWithData(const Data& data) {
    const std::optional<Data> shown = _privacy.shown(data, technology(), _clock.now());
    if (!shown)
        return;
    if (_onShown)
        _onShown(*shown);
    VelmoraModel::updateWithData(*shown);
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/MaskingModel.h"

#include "App/PrivacySwitch.h"

namespace velmora {

void MaskingModel::updateWithData(const Data& data) {
    const std::optional<Data> shown = _privacy.shown(data, technology(), _clock.now());
    if (!shown)
        return;
    if (_onShown)
        _onShown(*shown);
    VelmoraModel::updateWithData(*shown);
}

} // namespace velmora

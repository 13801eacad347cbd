// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/MaskingModel.h"

#include "App/PrivacySwitch.h"

namespace velmora {

void MaskingModel::updateWithData(const Data& data) {
    if (const std::optional<Data> shown = _privacy.shown(data, technology(), _clock.now()))
        VelmoraModel::updateWithData(*shown);
}

} // namespace velmora

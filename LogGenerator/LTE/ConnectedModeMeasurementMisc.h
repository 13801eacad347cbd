// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// "Connected mode LTE Intra-frequency Measurement": the serving cell as connected mode measures it.
class ConnectedModeMeasurementMisc final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override {
        return "Connected mode LTE Intra-frequency Measurement";
    }
    [[nodiscard]] std::span<const View> views() const override;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/IFX/IFXDisplay.h"
#include "Telephony/Drives/Truth/DriveTruth.h"
#include "Telephony/Drives/Truth/StatedCell.h"
#include "Telephony/Drives/Truth/StatedCondition.h"
#include "Telephony/Drives/Truth/StatedContexts.h"
#include "Telephony/Drives/Truth/StatedState.h"

namespace velmora {

/// What the phone of the IFX scenario does. Each message states all of it.
class IFXTruth final : public DriveTruth {
public:
    /// Both must outlive this.
    IFXTruth(const IFXPhone& phone, TruthSink& sink)
        : DriveTruth(sink), _phone(phone), _cell(sink),
          _registration(sink, "registration-state", "registration"),
          _area(sink, "area-update", "registration"), _limited(sink, "limited-service"),
          _searching(sink, "out-of-service"), _contexts(sink) {}

    void follow(TruthTime at, std::optional<std::uint32_t> code) override;
    void finish() override;

private:
    const IFXPhone& _phone;
    StatedCell _cell;
    StatedState _registration, _area;
    StatedCondition _limited, _searching;
    StatedContexts _contexts;
    bool _wasCall = false;
};

} // namespace velmora

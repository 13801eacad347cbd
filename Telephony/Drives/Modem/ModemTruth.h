// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/Modem/ModemPhone.h"
#include "Telephony/Drives/Truth/DriveTruth.h"
#include "Telephony/Drives/Truth/StatedCell.h"
#include "Telephony/Drives/Truth/StatedCondition.h"
#include "Telephony/Drives/Truth/StatedContexts.h"
#include "Telephony/Drives/Truth/StatedState.h"

namespace velmora {

/// What the modem of the Modem scenario does. Who decides on its cell no message shows.
class ModemTruth final : public DriveTruth {
public:
    /// Both must outlive this.
    ModemTruth(const ModemPhone& phone, TruthSink& sink)
        : DriveTruth(sink), _phone(phone), _cell(sink),
          _registration(sink, "registration-state", "registration"), _sim(sink, "sim-change", "SIM"),
          _limited(sink, "limited-service"), _searching(sink, "out-of-service"), _contexts(sink) {}

    void follow(TruthTime at, std::optional<std::uint32_t> code) override;
    void finish() override;

private:
    [[nodiscard]] TruthServing serving(std::uint32_t code) const;

    const ModemPhone& _phone;
    StatedCell _cell;
    StatedState _registration, _sim;
    StatedCondition _limited, _searching;
    StatedContexts _contexts;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/GSM/GSMPhone.h"
#include "Telephony/Drives/Truth/DriveTruth.h"
#include "Telephony/Drives/Truth/StatedCell.h"
#include "Telephony/Drives/Truth/StatedCondition.h"
#include "Telephony/Drives/Truth/StatedContexts.h"
#include "Telephony/Drives/Truth/StatedState.h"

namespace velmora {

/// What the phone of the GSM scenario does.
class GSMTruth final : public DriveTruth {
public:
    /// Both must outlive this.
    GSMTruth(const GSMPhone& phone, TruthSink& sink);

    void follow(TruthTime at, std::optional<std::uint32_t> code) override;
    void finish() override { _limited.finish(); }

private:
    void followStates(TruthTime at, std::uint32_t code);
    /// Location and routing area updates, and the call, which are states of the two mobility managements.
    void followMobility(TruthTime at);
    [[nodiscard]] TruthServing serving(std::uint32_t code) const;

    const GSMPhone& _phone;
    StatedCell _cell;
    StatedState _rr, _rrc, _mm, _gmm, _registration;
    StatedCondition _limited;
    StatedContexts _contexts;
    records::MMState _lastMM = records::MMState::Null;
    records::GMMState _lastGMM = records::GMMState::Null;
};

} // namespace velmora

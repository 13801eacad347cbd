// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/Truth/DriveTruth.h"
#include "Telephony/Drives/Truth/StatedCell.h"
#include "Telephony/Drives/Truth/StatedCondition.h"
#include "Telephony/Drives/Truth/StatedContexts.h"
#include "Telephony/Drives/Truth/StatedState.h"
#include "Telephony/Drives/UTRAN/UTRANReports.h"

namespace velmora {

/// What the phone of the UTRAN scenario does. That a connection is a call no record states.
class UTRANTruth final : public DriveTruth {
public:
    /// Both must outlive this.
    UTRANTruth(const UTRANPhone& phone, TruthSink& sink)
        : DriveTruth(sink), _phone(phone), _cell(sink), _rrc(sink, "radio-state", "RRC"),
          _area(sink, "area-update", "registration"), _limited(sink, "limited-service"), _contexts(sink) {}

    void follow(TruthTime at, std::optional<std::uint32_t> code) override;
    void followUnusual(TruthTime at, UnusualMessage kind, std::size_t number) override;
    void finish() override { _limited.finish(); }

private:
    [[nodiscard]] TruthServing serving(std::uint32_t code) const;

    const UTRANPhone& _phone;
    StatedCell _cell;
    StatedState _rrc, _area;
    StatedCondition _limited;
    StatedContexts _contexts;
    bool _isRRCShown = true; ///< not after a record of it that is too short
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/LTE/LTEReports.h"
#include "Telephony/Drives/Truth/DriveTruth.h"
#include "Telephony/Drives/Truth/StatedCell.h"
#include "Telephony/Drives/Truth/StatedContexts.h"
#include "Telephony/Drives/Truth/StatedState.h"

namespace velmora {

/// What the phone of the LTE scenario does.
class LTETruth final : public DriveTruth {
public:
    /// Both must outlive this.
    LTETruth(const LTEPhone& phone, TruthSink& sink)
        : DriveTruth(sink), _phone(phone), _cell(sink), _contexts(sink),
          _area(sink, "area-update", "tracking"), _mode(sink, "radio-state", "mode") {}

    void follow(TruthTime at, std::optional<std::uint32_t> code) override;
    void followUnusual(TruthTime at, UnusualMessage kind, std::size_t number) override;

private:
    void followMode(TruthTime at, std::uint32_t code);
    [[nodiscard]] TruthServing serving(std::uint32_t code) const;

    const LTEPhone& _phone;
    StatedCell _cell;
    StatedContexts _contexts;
    StatedState _area;
    StatedState _mode;                  ///< which no record names: the two modes have their own measurements
    TruthMode _shown = TruthMode::Idle; ///< which of the two measurements came last
};

} // namespace velmora

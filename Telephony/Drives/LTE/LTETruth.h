// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/LTE/LTEReports.h"
#include "Telephony/Drives/Truth/DriveTruth.h"
#include "Telephony/Drives/Truth/RadioConditions.h"
#include "Telephony/Drives/Truth/StatedCell.h"
#include "Telephony/Drives/Truth/StatedContexts.h"
#include "Telephony/Drives/Truth/StatedReselections.h"
#include "Telephony/Drives/Truth/StatedState.h"

namespace velmora {

/// What the phone of the LTE scenario does.
class LTETruth final : public DriveTruth {
public:
    /// Both must outlive this.
    LTETruth(const LTEReportContext& context, TruthSink& sink)
        : DriveTruth(sink), _context(context), _phone(context.phone), _cell(sink), _reselections(sink),
          _contexts(sink), _area(sink, "area-update", "tracking"), _mode(sink, "radio-state", "mode"),
          _conditions(sink) {}

    void follow(TruthTime at, std::optional<std::uint32_t> code) override;
    void followUnusual(TruthTime at, UnusualMessage kind, std::size_t number) override;
    void finish() override { _conditions.finish(); }

private:
    void followMeasurements(TruthTime at, std::uint32_t code);
    void followNeighbours(TruthTime at, std::uint32_t code);
    void followMode(TruthTime at, std::uint32_t code);
    [[nodiscard]] TruthServing serving(std::uint32_t code) const;

    const LTEReportContext& _context;
    const LTEPhone& _phone;
    StatedCell _cell;
    StatedReselections _reselections;
    StatedContexts _contexts;
    StatedState _area;
    StatedState _mode; ///< which no record names: the two modes have their own measurements
    RadioConditions _conditions;
    bool _hasNeighbours = false;        ///< whether those of the serving cell's carrier have been reported
    TruthMode _shown = TruthMode::Idle; ///< which of the two measurements came last
};

} // namespace velmora

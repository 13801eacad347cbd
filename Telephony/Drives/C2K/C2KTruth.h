// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/C2K/C2KReports.h"
#include "Telephony/Drives/Truth/DriveTruth.h"
#include "Telephony/Drives/Truth/StatedCell.h"
#include "Telephony/Drives/Truth/StatedState.h"

namespace velmora {

/// What the phone of the CDMA2000 scenario does. Its two radios are on the same pilot, but each has a state
/// of its own, and is on a cell only when it has acquired it.
class C2KTruth final : public DriveTruth {
public:
    /// Both must outlive this.
    C2KTruth(const C2KReportContext& context, TruthSink& sink)
        : DriveTruth(sink), _context(context), _oneXCell(sink), _evdoCell(sink),
          _oneX(sink, "radio-state", "1x"), _evdo(sink, "radio-state", "EV-DO"),
          _session(sink, "evdo-session", "EV-DO session") {}

    void follow(TruthTime at, std::optional<std::uint32_t> code) override;

private:
    [[nodiscard]] TruthServing oneXServing(std::uint32_t code) const;
    [[nodiscard]] TruthServing evdoServing(std::uint32_t code) const;
    void followCall(TruthTime at);

    const C2KReportContext& _context;
    StatedCell _oneXCell, _evdoCell;
    StatedState _oneX, _evdo, _session;
    bool _wasInTraffic = false;
};

} // namespace velmora

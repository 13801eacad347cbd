// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/C2K/C2KReports.h"
#include "Telephony/Drives/Truth/DriveTruth.h"
#include "Telephony/Drives/Truth/RadioConditions.h"
#include "Telephony/Drives/Truth/StatedCell.h"
#include "Telephony/Drives/Truth/StatedState.h"

#include <cstdint>
#include <optional>

namespace velmora {

/// What the phone of the CDMA2000 scenario does. Its two radios are on the same pilot, but each has a state
/// of its own, and is on a cell only when it has acquired it.
class C2KTruth final : public DriveTruth {
public:
    /// Both must outlive this.
    C2KTruth(const C2KReportContext& context, TruthSink& sink)
        : DriveTruth(sink), _context(context), _oneXCell(sink), _evdoCell(sink),
          _oneX(sink, "radio-state", "1x"), _evdo(sink, "radio-state", "EV-DO"),
          _session(sink, "evdo-session", "EV-DO session"), _conditions(sink),
          _errors(sink, "fer-alarm", std::chrono::seconds(3), std::chrono::seconds(3)),
          _stall(sink, "data-stall", std::chrono::seconds(10), TruthTime(0)) {}

    void follow(TruthTime at, std::optional<std::uint32_t> code) override;
    void finish() override;

private:
    [[nodiscard]] TruthServing oneXServing(std::uint32_t code) const;
    [[nodiscard]] TruthServing evdoServing(std::uint32_t code) const;
    void followCall(TruthTime at);
    void followMeasurements(TruthTime at, std::uint32_t code);
    void followTraffic(TruthTime at, std::uint32_t code);

    const C2KReportContext& _context;
    StatedCell _oneXCell, _evdoCell;
    StatedState _oneX, _evdo, _session;
    RadioConditions _conditions;
    HeldCondition _errors, _stall;
    std::optional<std::int64_t> _received, _sent; ///< bits, as last reported
    std::optional<bool> _isReceiving, _isSending; ///< between the last two reports of each link
    double _errorRate = 0;                        ///< of the frames of this call
    bool _wasInTraffic = false;
};

} // namespace velmora

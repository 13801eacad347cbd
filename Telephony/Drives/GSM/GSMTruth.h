// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/GSM/GSMReports.h"
#include "Telephony/Drives/Truth/DriveTruth.h"
#include "Telephony/Drives/Truth/RadioConditions.h"
#include "Telephony/Drives/Truth/StatedCell.h"
#include "Telephony/Drives/Truth/StatedCondition.h"
#include "Telephony/Drives/Truth/StatedContexts.h"
#include "Telephony/Drives/Truth/StatedReselections.h"
#include "Telephony/Drives/Truth/StatedState.h"

#include <deque>
#include <vector>

namespace velmora {

/// What the phone of the GSM scenario does.
class GSMTruth final : public DriveTruth {
public:
    /// Both must outlive this.
    GSMTruth(const GSMReportContext& context, TruthSink& sink);

    void follow(TruthTime at, std::optional<std::uint32_t> code) override;
    void followUnusual(TruthTime at, UnusualMessage kind, std::size_t number) override;
    void finish() override;

private:
    /// Transport blocks so far, and how many came wrong.
    struct Blocks {
        TruthTime at;
        std::int64_t all;
        std::int64_t wrong;
    };

    enum class Call : std::uint8_t { None, Active, Reestablishing };

    void followStates(TruthTime at, std::uint32_t code);
    /// Location and routing area updates, which are states of the two mobility managements.
    void followMobility(TruthTime at);
    void followCall(TruthTime at);
    void followMeasurements(TruthTime at, std::uint32_t code);
    void followGSM(TruthTime at, std::uint32_t code);
    void followUMTS(TruthTime at, std::uint32_t code);
    void followErrors(TruthTime at);
    /// A message reports the best cells of UMTS, so many at most.
    void compareUMTS(TruthTime at, std::size_t limit);
    [[nodiscard]] Call call() const;
    [[nodiscard]] TruthServing serving(std::uint32_t code) const;

    const GSMReportContext& _context;
    const GSMPhone& _phone;
    StatedCell _cell;
    StatedReselections _reselections;
    StatedState _rr, _rrc, _mm, _gmm, _registration;
    StatedCondition _limited;
    StatedContexts _contexts;
    RadioConditions _conditions;
    HeldCondition _errors;
    std::deque<Blocks> _blocks; ///< of the last reports: one that is five seconds old, and those since
    Call _lastCall = Call::None;
    records::MMState _lastMM = records::MMState::Null;
    records::GMMState _lastGMM = records::GMMState::Null;
};

} // namespace velmora

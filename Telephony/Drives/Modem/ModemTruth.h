// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/Modem/ModemPhone.h"
#include "Telephony/Drives/Truth/DriveTruth.h"
#include "Telephony/Drives/Truth/RadioConditions.h"
#include "Telephony/Drives/Truth/StatedCell.h"
#include "Telephony/Drives/Truth/StatedCondition.h"
#include "Telephony/Drives/Truth/StatedContexts.h"
#include "Telephony/Drives/Truth/StatedState.h"

#include <vector>

namespace velmora {

/// What the modem of the Modem scenario does. Who decides on its cell no message shows.
class ModemTruth final : public DriveTruth {
public:
    /// All must outlive this.
    ModemTruth(const ModemPhone& phone, const NRNetwork& network, TruthSink& sink)
        : DriveTruth(sink), _phone(phone), _network(network), _cell(sink),
          _registration(sink, "registration-state", "registration"), _sim(sink, "sim-change", "SIM"),
          _limited(sink, "limited-service"), _searching(sink, "out-of-service"), _contexts(sink),
          _conditions(sink, std::chrono::seconds(5)),
          _stall(sink, "data-stall", std::chrono::seconds(10), TruthTime(0)) {}

    void follow(TruthTime at, std::optional<std::uint32_t> code) override;
    void finish() override;

private:
    /// The counters of a bearer, as last reported.
    struct Counters {
        int number;
        double start_s; ///< of the connection
        ModemBearer::Answer answer;
    };

    void followContexts(TruthTime at);
    void followTraffic(TruthTime at);
    void followMeasurements(TruthTime at, std::uint32_t code);
    void followNeighbours(TruthTime at);
    [[nodiscard]] TruthServing serving(std::uint32_t code) const;

    const ModemPhone& _phone;
    const NRNetwork& _network;
    StatedCell _cell;
    StatedState _registration, _sim;
    StatedCondition _limited, _searching;
    StatedContexts _contexts;
    RadioConditions _conditions;
    HeldCondition _stall;
    std::vector<Counters> _counters;
};

} // namespace velmora

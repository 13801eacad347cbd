// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/IFX/IFXDisplay.h"
#include "Telephony/Drives/Scenario.h"
#include "Telephony/Drives/Truth/DriveTruth.h"

#include <cstddef>
#include <memory>

namespace velmora {

/// A drive through the GSM cells of RadioNetwork, in the IFX technology: once a second the baseband sends its
/// complete display as one property list, in the binary and the XML form alternately. What an engineer sees
/// in a round of two and a half minutes:
///
/// - Searching: neighbours alone. Then a serving cell in limited service, then registration.
/// - Idle: identities, serving cell, six neighbours whose levels rise and fall; reselection to a neighbour
///   that is 6 dB better, and the area with it.
/// - A call: its dedicated channel with the receive quality and the seconds that it lasts; handovers.
/// - A packet session of one context, then one of two, with the coding scheme.
/// - Again from the start, at another place of the ring.
///
/// Some dictionaries have one entry, in every message or at times, and there is a chain of them; they are
/// shown as their single value. No message is malformed, unlike those of the other scenarios: this
/// technology's decoder ends the application where it cannot read one, or where one holds anything but
/// dictionaries, arrays and strings.
///
/// Everything depends only on the seed: the same seed results in the same bytes. Main thread only.
class IFXScenario final : public Scenario {
public:
    explicit IFXScenario(std::uint64_t seed);

    [[nodiscard]] std::string_view technology() const override;
    [[nodiscard]] ScenarioEvent next() override;
    [[nodiscard]] RoadPlace place() const override;
    void setIdentities(const DriveIdentities& identities) override { _phone.identities = identities; }
    void tellTruth(TruthSink& sink) override;
    void finishTruth() override;

    /// What the last message was of: the phone and the cells around it.
    [[nodiscard]] const IFXPhone& phone() const { return _phone; }
    [[nodiscard]] const RadioNetwork& network() const { return _network; }

private:
    void followTimeline();
    void camp();

    RadioNetwork _network;
    ScenarioRandom _random;
    IFXPhone _phone;
    std::unique_ptr<DriveTruth> _truth; ///< null where none wants it
    int _seconds = 0;                   ///< messages so far
    std::size_t _phase = 0;
    int _phaseEnd = 0;
};

} // namespace velmora

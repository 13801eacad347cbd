// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/DriveScenario.h"
#include "Telephony/Drives/LTE/LTEReports.h"

namespace velmora {

/// A drive through an LTE network of test networks 001/01 and 001/02, in the Ostrel LTE technology
/// (LTENetwork). What an engineer sees in a round of less than three minutes:
///
/// - Power-on: cells of band 3 found; the serving cell with its frequencies, bandwidth and identity; then
///   registration in connected mode and a first packet-data context.
/// - Idle: level, quality and selection parameters of the serving cell; up to six neighbours whose levels
///   rise and fall, every fourth time those of another carrier; reselection when a neighbour has been 4 dB
///   better for 2 s. Where the tracking area changes (7101 and 7102 in 001/01, 8201 in 001/02) the phone
///   connects for its update, and the SIM's location follows.
/// - A packet session: connected mode with the serving cell's filtered level, up to six measured neighbours
///   and three detected cells, and handovers; now and then a second context.
/// - A walk over all carriers, 20 MHz down to 1.4, at each of them idle and briefly connected. On the two
///   narrowest the search for other frequencies has no threshold ("Not Present"); in 001/02 the power has no
///   limit. Then power-off, and again from the start, at another place of the ring.
///
/// In idle mode reselection candidates come one by one: of LTE, UTRAN, GERAN, CDMA 1x, CDMA HRPD and of an
/// unknown technology. Every seventh time three come at once; then each but the last shows as its own channel
/// and cell the priority and type of the one after it, since that is where the record has them.
///
/// From six to eight messages come a second. The extra stream reports the SIM, the cells around and the
/// contexts, as binary and XML property lists in turn. About every ten seconds a message is unusual (see
/// UnusualMessage): the records of serving cell, idle and connected measurement, neighbours and candidates
/// are too short in rotation, and each of the three counted ones has a count that is too high. Main thread
/// only.
class LTEScenario final : public DriveScenario {
public:
    explicit LTEScenario(std::uint64_t seed);
    [[nodiscard]] std::string_view technology() const override;
    void setIdentities(const DriveIdentities& identities) override { _phone.identities = identities; }
    /// Reselections that come late and early, in a round of less than three minutes.
    void addIncidents() override;

    /// What the messages are of: the phone and the cells around it after the last step.
    [[nodiscard]] const LTEPhone& phone() const { return _phone; }
    [[nodiscard]] const LTENetwork& network() const { return _network; }

private:
    static const Phase phases[];
    static const Phase incidents[];

    /// The phone's procedures; each adds its steps to the script, from now on.
    void powerOn();
    void registerWithNetwork();
    void startSession();
    void endSession();
    /// Reselects to the best cell of the next carrier.
    void changeCarrier();
    void connectBriefly();
    /// Sends a tracking area update if the network has another area.
    void updateArea();
    void powerOff();
    /// The phone stays on its cell, however weak, until `letGo`.
    void holdOn() { _isHoldingOn = true; }
    void letGo() { _isHoldingOn = false; }
    /// Reselects to the best cell that is weaker.
    void reselectEarly();

    void drive(double seconds) override;
    [[nodiscard]] const RadioNetwork& road() const override { return _network.radio(); }
    void react() override;
    void addReports(DriveScript& due) override;
    [[nodiscard]] UnusualMessageParts unusualMessageParts(std::size_t number) override;
    [[nodiscard]] std::unique_ptr<DriveTruth> makeTruth(TruthSink& sink) const override;

    /// Camps on the best cell of the phone's carrier, where there is one, and reports it.
    std::optional<RecordBuilder> camp();
    std::optional<RecordBuilder> campOn(const LTEMeasurement& cell);
    void addConnectedStep(double delay, bool connected);
    void addContextsStep(double delay, int count);

    LTENetwork _network;
    LTEPhone _phone;
    LTEReportContext _context;
    bool _isHoldingOn = false;
};

} // namespace velmora

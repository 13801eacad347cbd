// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/DriveScenario.h"
#include "Telephony/Drives/GSM/GSMPhone.h"
#include "Telephony/Drives/GSM/GSMProcedures.h"
#include "Telephony/Drives/GSM/GSMReports.h"

namespace velmora {

/// A drive through a GSM/UMTS network of test networks 001/01 and 001/02, in the Ostrel GSM technology. The
/// car goes round a ring road past twelve sites (RadioNetwork); what an engineer sees in a round of about six
/// minutes:
///
/// - Power-on: network search with the lists filling, cell selection, then location update and attach, with
///   the mobility states in protocol order and the equivalent networks at the end.
/// - Idle on GSM: serving cell, six neighbours whose levels rise and fall, their BSICs, the GPRS cell
///   options; reselection when a neighbour has been 6 dB better for 5 s, and a location and routing area
///   update where the area changes (4101 and 4102 in 001/01, 5201 in 001/02). Every few minutes the network
///   changes.
/// - A packet session on GSM: one context with its address and class of service.
/// - An outgoing call on GSM with handovers, hopping list and DTX, and its handover to UMTS.
/// - UMTS idle, then a packet session there: Connecting, CELL_FACH, CELL_DCH with active set, transmit power,
///   HARQ counters of six processes (now and then dual carrier), block errors that follow the Ec/No, two
///   contexts; then CELL_FACH, CELL_PCH, URA_PCH and back to idle.
/// - Reselection to GSM, to UMTS and back, each with its area update; then detach, power-off, and again from
///   the start, at another place of the ring.
///
/// About twenty messages come a second. The extra stream reports the SIM, the cells around and the contexts,
/// as binary and XML property lists in turn. About every ten seconds a message is unusual (see
/// UnusualMessage). Main thread only.
class GSMScenario final : public DriveScenario {
public:
    explicit GSMScenario(std::uint64_t seed);
    [[nodiscard]] std::string_view technology() const override;
    void setIdentities(const DriveIdentities& identities) override { _phone.identities = identities; }
    /// Calls whose radio link fails, one of which is re-established and one is not, and reselections that
    /// come late and early, in a round of less than five minutes.
    void addIncidents() override;

    /// What the messages are of: the phone and the cells around it after the last step.
    [[nodiscard]] const GSMPhone& phone() const { return _phone; }
    [[nodiscard]] const RadioNetwork& network() const { return _network; }

private:
    static const Phase phases[];
    static const Phase incidents[];

    /// Begins that procedure now.
    template <void (GSMProcedures::*procedure)(double now)>
    void begin() {
        (_procedures.*procedure)(now());
    }

    /// The phone stays on its cell, however weak, until `letGo`.
    void holdOn() { _isHoldingOn = true; }
    void letGo() { _isHoldingOn = false; }
    /// Reselects to the best cell that is weaker.
    void reselectEarly();

    void drive(double seconds) override;
    [[nodiscard]] const RadioNetwork& road() const override { return _network; }
    void react() override;
    void addReports(DriveScript& due) override;
    [[nodiscard]] UnusualMessageParts unusualMessageParts(std::size_t number) override;
    [[nodiscard]] std::unique_ptr<DriveTruth> makeTruth(TruthSink& sink) const override;

    RadioNetwork _network;
    GSMPhone _phone;
    GSMProcedures _procedures;
    GSMReportContext _context;
    bool _isHoldingOn = false;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/C2K/C2KReports.h"
#include "Telephony/Drives/DriveScenario.h"

namespace velmora {

/// A drive through a CDMA2000 network with 1x and EV-DO carriers, in the Ostrel CDMA technology (C2KNetwork).
/// What an engineer sees in a round of about four minutes:
///
/// - Power-on: Powerup, Initial, Acquisition and Sync, with no system found; then Paging, with the system's
///   and the base station's identities. EV-DO follows with Acquisition, Sync and the session's negotiation up
///   to Open, with a new UATI.
/// - Idle on both: 1x sleeps between pages, one pilot each, the second receive chain and the transmitters
///   "N/A", two kbit/s of EV-DO control channel. The serving pilot changes when another has been 3 dB better
///   for 2 s; system, network, zone and base station change with it, and so do band and channels where the
///   phone roams.
/// - An EV-DO connection: Access, then Connected with up to three pilots, both chains and the transmitter,
///   and the data rates that the C/I allows; then Idle.
/// - A 1x call: no sleep while the phone accesses the network, then Traffic with up to three pilots, both
///   chains and a frame error rate that follows the pilots' Ec/Io; after it the last average marked as old.
///   EV-DO is Inactive meanwhile, as the one transmitter is the call's, and comes back after it.
/// - A second EV-DO connection, then power-off, and again from the start, at another place of the ring.
///
/// About ten messages come a second, twenty in a call. About every ten seconds a message is unusual (see
/// UnusualMessage): records of all kinds that come too short, a system identification that lacks the base
/// station, counts that are too high, sub-packets that are missing or too large. There is no extra stream.
/// Main thread only.
class C2KScenario final : public DriveScenario {
public:
    explicit C2KScenario(std::uint64_t seed);
    [[nodiscard]] std::string_view technology() const override;
    /// The records have none of them: the UATI is the network's, and random anyway.
    void setIdentities(const DriveIdentities& /*identities*/) override {}
    /// An EV-DO connection on which nothing arrives for a while, twice, in a round of some two minutes.
    void addIncidents() override;

    /// What the messages are of: the phone and the cells around it after the last step.
    [[nodiscard]] const C2KPhone& phone() const { return _phone; }
    [[nodiscard]] const C2KNetwork& network() const { return _network; }

private:
    static const Phase phases[];
    static const Phase incidents[];

    /// The phone's procedures; each adds its steps to the script, from now on.
    void powerOn();
    void connect();
    void disconnect();
    void startCall();
    void endCall();
    void powerOff();
    void stall() { _context.isStalled = true; }
    void flow() { _context.isStalled = false; }

    void drive(double seconds) override;
    [[nodiscard]] const RadioNetwork& road() const override { return _network.radio(); }
    void react() override;
    void addReports(DriveScript& due) override;
    void countUntil(double at) override { _context.transferUntil(at); }
    [[nodiscard]] UnusualMessageParts unusualMessageParts(std::size_t number) override;
    [[nodiscard]] std::unique_ptr<DriveTruth> makeTruth(TruthSink& sink) const override;

    void add1xStep(double delay, records::OneXState state);
    void addEVDOStep(double delay, records::EVDOState state);
    void addSessionStep(double delay, records::EVDOSession session);
    /// Acquires the EV-DO carrier again, with the session that there is.
    void addEVDOReturn(double delay);

    C2KNetwork _network;
    C2KPhone _phone;
    C2KReportContext _context;
};

} // namespace velmora

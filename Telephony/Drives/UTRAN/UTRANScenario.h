// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/DriveScenario.h"
#include "Telephony/Drives/UTRAN/UTRANReports.h"

namespace velmora {

/// A drive through a TD-SCDMA network of test networks 001/01 and 001/02, in the Ostrel UTRAN2 technology
/// (UTRANNetwork). What an engineer sees in a round of less than four minutes:
///
/// - Power-on: cells found, all of the detected set; then a serving cell that allows emergency calls only.
/// - Registration: Connecting, Cell DCH and back to Disconnected; from then on the cell allows all calls.
/// - Idle: the serving cell as ASET, up to five neighbours as MSET, further ones as DSET, those of the other
///   network without a status; their levels rise and fall. Reselection when a neighbour has been 5 dB better
///   for 3 s, and a new registration where the area changes. Six GSM neighbours are measured all along, which
///   the decoder does not show.
/// - A packet session: Connecting, Cell Fach, Cell DCH with one context, the block errors of two transport
///   channels and the signal-to-interference ratios of two composite ones with one and four time slots; its
///   end goes over Cell Fach, Cell PCH and Cell URA PCH to Disconnected, and the quality lists empty.
/// - A call: Cell DCH with four transport channels on one composite one, and handovers.
/// - A packet session with two contexts; then power-off with every list empty, and again from the start.
///
/// About ten messages come a second. The extra stream reports the SIM, the cells around and the contexts, as
/// binary and XML property lists in turn. About every ten seconds a message is unusual (see UnusualMessage):
/// the records of the RRC state and of the serving cell come too short alternately - after the former the
/// state is unknown until the next report - and each of the three counted records comes with a count too
/// high. Main thread only.
class UTRANScenario final : public DriveScenario {
public:
    explicit UTRANScenario(std::uint64_t seed);
    [[nodiscard]] std::string_view technology() const override;
    void setIdentities(const DriveIdentities& identities) override { _phone.identities = identities; }

    /// What the messages are of: the phone and the cells around it after the last step.
    [[nodiscard]] const UTRANPhone& phone() const { return _phone; }
    [[nodiscard]] const UTRANNetwork& network() const { return _network; }

private:
    static const Phase phases[];

    /// The phone's procedures; each adds its steps to the script, from now on.
    void powerOn();
    void registerWithNetwork();
    void startSession();
    void endSession();
    void startCall();
    void endCall();
    void powerOff();

    void drive(double seconds) override;
    [[nodiscard]] const RadioNetwork& road() const override { return _network.radio(); }
    void react() override;
    void addReports(DriveScript& due) override;
    [[nodiscard]] UnusualMessageParts unusualMessageParts(std::size_t number) override;
    [[nodiscard]] std::unique_ptr<DriveTruth> makeTruth(TruthSink& sink) const override;

    void addRRCStep(double delay, records::RRCState state);
    void addContextsStep(double delay, int count);

    UTRANNetwork _network;
    UTRANPhone _phone;
    UTRANReportContext _context;
    int _sessions = 0; ///< packet sessions so far
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/DriveScript.h"
#include "Telephony/Drives/GSM/GSMPhone.h"

#include <optional>
#include <utility>

namespace velmora {

/// What the phone of the GSM scenario goes through with the network, state by state as the protocols order
/// it: each procedure puts its steps on a script, and whoever runs the scenario plays the script in its time.
/// A step changes the phone and gives the record that tells of it.
class GSMProcedures {
public:
    /// All three must outlive this.
    GSMProcedures(GSMPhone& phone, const RadioNetwork& network, DriveScript& script)
        : _phone(phone), _network(network), _script(script) {}

    /// Each begins at `now`, in seconds from the scenario's start.
    void powerOn(double now);        ///< 9 s: network search, up to camping on GSM
    void attach(double now);         ///< 6 s: location update and GPRS attach
    void updateArea(double now);     ///< 3 s: location and routing area update
    void startSession(double now);   ///< 3 s: a packet session, on whichever radio the phone is
    void endSession(double now);     ///< 2 s on GSM, 6 s on UMTS
    void startCall(double now);      ///< 3 s: an outgoing call on GSM
    void endCall(double now);        ///< 2 s
    void handOverToUMTS(double now); ///< 2 s: with the call that is on
    void reselectToUMTS(double now); ///< 2 s
    void reselectToGSM(double now);  ///< 2 s
    void reselectWithinGSM(double now, const GSMMeasurement& better);
    void reselectWithinUMTS(double now, const UMTSMeasurement& better);
    void powerOff(double now); ///< 4 s: detach and off

private:
    void say(double at, DriveStep step) { _script.emplace(at, std::move(step)); }
    void sayRegistration(double at, records::RegistrationState state);
    void sayMM(double at, records::MMState state, records::MMSubState subState);
    void sayGMM(double at, records::GMMState state, records::GMMSubState subState);
    void sayRR(double at, records::RRState state);
    void sayRRC(double at, records::RRCState state);
    void sayContexts(double at, int count);
    void sayDedicatedChannel(double at);
    /// The signalling connection on whichever radio the phone is; takes a second.
    void connect(double at);
    void release(double at);
    /// The network's acceptance of a location update: identities and the equivalent networks.
    void accept(double at);
    /// The phone moves to the best cell there; its record, none where there is no cell.
    [[nodiscard]] std::optional<RecordBuilder> campOnGSM();
    [[nodiscard]] std::optional<RecordBuilder> campOnUMTS();

    GSMPhone& _phone;
    const RadioNetwork& _network;
    DriveScript& _script;
    bool _binary = false; ///< the form of the next context list; the two alternate
};

} // namespace velmora

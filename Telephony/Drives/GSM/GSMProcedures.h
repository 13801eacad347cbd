// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/GSM/GSMSteps.h"

namespace velmora {

/// The procedures of the GSM scenario's phone with the network, state by state as the protocols order them.
/// Each puts its steps on the script, which the scenario plays.
class GSMProcedures : private GSMSteps {
public:
    using GSMSteps::GSMSteps;

    /// Each begins at `now`, in seconds from the scenario's start.
    void powerOn(double now);         ///< 9 s: network search, up to camping on GSM
    void attach(double now);          ///< 6 s: location update and GPRS attach
    void updateArea(double now);      ///< 3 s: location and routing area update
    void startSession(double now);    ///< 3 s: a packet session, on whichever radio the phone is
    void endSession(double now);      ///< 2 s on GSM, 6 s on UMTS
    void startCall(double now);       ///< 3 s: an outgoing call on GSM
    void endCall(double now);         ///< 2 s
    void reestablishCall(double now); ///< 3 s: the radio link fails, and the call goes on
    void loseCall(double now);        ///< 7 s: the same, and it does not
    void handOverToUMTS(double now);  ///< 2 s: with the call that is on
    void reselectToUMTS(double now);  ///< 2 s
    void reselectToGSM(double now);   ///< 2 s
    void reselectWithinGSM(double now, const GSMMeasurement& better);
    void reselectWithinUMTS(double now, const UMTSMeasurement& better);
    void powerOff(double now); ///< 4 s: detach and off

private:
    /// The first steps of a re-establishment (3GPP TS 24.008 4.5.1.6), which take a second.
    void tryReestablishment(double now);
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/DriveScript.h"
#include "Telephony/Drives/GSM/GSMPhone.h"
#include "Telephony/Drives/GSM/RegistrationRecords.h"

#include <optional>
#include <utility>

namespace velmora {

/// The steps of which the GSM scenario's procedures consist: each is put on a script for its time; when the
/// script comes to it, it changes the phone and returns the record that reports the change. `at` is in
/// seconds from the scenario's start.
class GSMSteps {
public:
    /// All three must outlive this.
    GSMSteps(GSMPhone& phone, const RadioNetwork& network, DriveScript& script)
        : _phone(phone), _network(network), _script(script) {}

protected:
    void addStep(double at, DriveStep step) { _script.emplace(at, std::move(step)); }
    void addRegistrationStep(double at, records::RegistrationState state);
    void addMMStep(double at, records::MMState state, records::MMSubState subState);
    void addGMMStep(double at, records::GMMState state, records::GMMSubState subState);
    void addRRStep(double at, records::RRState state);
    void addRRCStep(double at, records::RRCState state);
    void addContextsStep(double at, int count);
    void addDedicatedChannelStep(double at);
    /// The signalling connection on whichever radio the phone is; takes a second.
    void connect(double at);
    void release(double at);
    /// The network's acceptance of a location update: identities and the equivalent networks.
    void accept(double at);
    /// The phone camps on the best cell; returns its record, none where there is no cell.
    [[nodiscard]] std::optional<RecordBuilder> campOnGSM();
    [[nodiscard]] std::optional<RecordBuilder> campOnUMTS();

    GSMPhone& _phone;
    const RadioNetwork& _network;
    DriveScript& _script;
    bool _binary = false; ///< the form of the next context list; the two alternate
};

} // namespace velmora

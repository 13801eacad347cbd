// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Telephony/Drives/DriveIdentities.h"
#include "Telephony/Drives/Road/RoadPlace.h"
#include "Telephony/Drives/Truth/TruthSink.h"

#include <chrono>
#include <string_view>

namespace velmora {

/// One message of a scenario and when it comes, counted from the scenario's start.
struct ScenarioEvent {
    std::chrono::nanoseconds offset{0};
    Data message;
};

/// A synthetic drive through a radio network: an endless list of messages that depends only on its seed. Its
/// player decides the speed.
class Scenario {
public:
    virtual ~Scenario() = default;
    /// The constant of its log technology.
    [[nodiscard]] virtual std::string_view technology() const = 0;
    /// The next message; offsets never go back.
    [[nodiscard]] virtual ScenarioEvent next() = 0;

    /// Where the car is: at the beginning of the step in which the last message was sent. Later messages are
    /// not before it.
    [[nodiscard]] virtual RoadPlace place() const = 0;

    /// The drive becomes that of this subscriber; the default is one of a test network. To be called before
    /// the first message.
    virtual void setIdentities(const DriveIdentities& identities) = 0;

    /// The drive becomes a short round of what its other drives never have, such as a call that is lost. To
    /// be called before the first message. The default is for a technology without such a round.
    virtual void addIncidents() {}

    /// What the drive's phone does is passed on from now on, which changes no message. To be called before
    /// the first message; the sink must outlive the scenario.
    virtual void tellTruth(TruthSink& sink) = 0;
    /// The drive is over: passes on what still lasts, if the truth is wanted.
    virtual void finishTruth() = 0;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Drive/DriveModel.h"
#include "Analysis/Drive/DriveNow.h"
#include "App/DriveView/DriveHistory.h"

#include <cstdint>
#include <span>
#include <string>

namespace velmora {

/// What the drive view shows: what is received, or a moment of a recording.
class DriveSource {
public:
    virtual ~DriveSource() = default;

    /// Events, series and classes: of a recording those of all that has been read of it.
    [[nodiscard]] virtual const DriveModel& model() const = 0;
    [[nodiscard]] virtual const DriveHistory& history() const = 0;

    /// The serving cell and its neighbours at the moment.
    [[nodiscard]] virtual DriveNow now() const = 0;
    [[nodiscard]] virtual std::span<const Neighbour> neighbours() const = 0;
    /// Against which ages are counted.
    [[nodiscard]] virtual Time moment() const = 0;
    /// Where the drive ends so far, which is the moment while messages arrive.
    [[nodiscard]] virtual Time end() const = 0;
    /// Another number after each change of what is known.
    [[nodiscard]] virtual std::uint64_t revision() const = 0;
    /// Why no messages arrive; empty where they do.
    [[nodiscard]] virtual std::string link() const = 0;
    /// How much of it has been read; empty once all has.
    [[nodiscard]] virtual std::string progress() const { return {}; }

    /// Whether the moment is chosen by the user, so that it can be another than the end.
    [[nodiscard]] virtual bool isRecorded() const { return false; }
    /// Moves to after the messages of that time, where the moment is chosen.
    virtual void choose(Time /*time*/) {}

    /// As DriveModel.
    virtual bool togglePin(const std::string& path) = 0;
};

} // namespace velmora

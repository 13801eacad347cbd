// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Picture/RadioPicture.h"
#include "Analysis/Picture/RadioTechnology.h"
#include "Platform/Clock.h"

#include <chrono>
#include <optional>
#include <string>

namespace velmora {

/// A value of the serving cell and when it was reported.
struct DriveValue {
    std::string text; ///< for people; of a level or quality without its unit
    double number = 0;
    Time time{};
};

/// What is known of the serving cell now. What is absent has not been reported, or was withdrawn.
struct DriveNow {
    /// An older value is shown as one of the past.
    static constexpr std::chrono::seconds freshness{5};

    std::optional<RadioTechnology> technology;
    std::optional<RadioMode> mode;
    std::optional<Time> reported;      ///< when a message last reported anything of the serving cell
    std::optional<DriveValue> state;   ///< of the radio, in the modem's words
    std::optional<DriveValue> network; ///< "001-01"
    std::optional<DriveValue> area;    ///< location or tracking area code
    std::optional<DriveValue> cell;    ///< identity
    std::optional<DriveValue> channel; ///< "6300"
    std::optional<DriveValue> band;    ///< "LTE band 20"; of the time of the channel
    std::optional<DriveValue> physicalCell;
    std::optional<DriveValue> level;   ///< dBm
    std::optional<DriveValue> quality; ///< dB
};

/// What the picture knows of it.
[[nodiscard]] DriveNow driveNow(const RadioPicture& picture);

} // namespace velmora

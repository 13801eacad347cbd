// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Browse/Data/DisplayRows.h"
#include "Tools/Browse/Data/InspectedMessage.h"
#include "Tools/Browse/Data/MessageRow.h"
#include "Tools/Browse/Passes/EventPass.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// The parts of the screen that keys act on.
enum class BrowsePart : std::uint8_t { Messages, Display, Content, Events };

/// All that a screen shows, as plain data: a screen is a function of this and its size.
struct BrowseView {
    std::string title; ///< file and technology, printable
    std::string place; ///< "message 12 of 2000"
    BrowsePart part = BrowsePart::Messages;

    std::vector<MessageRow> rows;
    std::size_t chosenRow = 0; ///< in `rows`

    std::vector<DisplayRow> display;
    std::size_t firstDisplayRow = 0; ///< that is shown
    std::size_t chosenDisplayRow = 0;

    std::vector<std::uint8_t> bytes;
    std::size_t chosenByte = 0;
    std::optional<FieldPlace> field; ///< that is highlighted

    std::vector<BrowsedEvent> events; ///< a window of them
    std::size_t chosenEvent = 0;      ///< in `events`
    std::string eventsNews;           ///< in place of events where there are none

    std::vector<std::optional<double>> levels; ///< two for each column of the strip
    std::optional<double> place01;             ///< of the chosen message in the drive, 0 to 1
    std::vector<double> eventPlaces;           ///< of events above info, the same

    std::string status;            ///< the last line
    bool isPrompt = false;         ///< the last line is being typed
    std::vector<std::string> help; ///< over all else, where there is any
};

} // namespace velmora

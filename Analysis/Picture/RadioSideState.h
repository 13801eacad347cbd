// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Picture/CellIdentity.h"
#include "Analysis/Picture/LeafUse.h"
#include "Analysis/Picture/RadioTechnology.h"
#include "Analysis/Picture/RoleReadings.h"

#include <cstdint>
#include <optional>

namespace velmora {

/// What the picture knows of one radio technology.
struct RadioSideState {
    RoleReadings readings;
    std::optional<RadioTechnology> technology; ///< of the serving cell
    std::optional<RadioMode> mode;
    std::optional<bool> isMovedByNetwork;
    bool isReported = false; ///< whether anything is known of a serving cell
    Time reported{};         ///< when a message last reported anything of it
    Time modeReported{};
    std::optional<CellIdentity> before; ///< the serving cell before this one
    std::optional<Time> since;          ///< when this one became it; only where a change was seen
    MessageNumber firstOfCell;          ///< the message that reported the change
    MessageNumber message;              ///< that did

    // Of the current message:
    std::optional<RadioMode> modeBefore;
    std::optional<bool> wasMovedByNetwork;
    bool isServing = false; ///< whether it reports anything of a serving cell
    bool isModeReported = false;
    bool hasNoArea = false;              ///< the area that it reports stands for none
    CellIdentity found;                  ///< the cell that it reports
    const CatalogueNode* list = nullptr; ///< of serving cells, of which it found the row
    std::uint32_t row = 0;

    void setMode(std::optional<RadioMode> newMode, bool byNetwork) {
        mode = newMode;
        // Without a cell there is nothing to move from.
        const bool hasCell = mode == RadioMode::Idle || mode == RadioMode::Connected;
        isMovedByNetwork = hasCell ? std::optional(byNetwork) : std::nullopt;
    }

    /// What is known of the serving cell.
    [[nodiscard]] CellIdentity identity() const;
    /// Notes what the message reports of a serving cell.
    void gather(const Observation& observation, const LeafUse& use, const TechnologyTable& table);
    /// Takes the mode from an observation. Whether it is a new one without a serving cell.
    bool takeMode(const Observation& observation, const LeafUse& use, Time now);
    /// Whether what the message has in the place of a cell is one.
    [[nodiscard]] bool reportsCell(const TechnologyTable& table) const;
    void forgetCell();
    void forgetAll();
    /// Whether it has anything that later messages or their readers would find.
    [[nodiscard]] bool isAnythingKnown() const {
        return isReported || mode || before || since || !readings.isEmpty();
    }

    void beginMessage() {
        modeBefore = mode;
        wasMovedByNetwork = isMovedByNetwork;
        isServing = isModeReported = hasNoArea = false;
        found.cell.reset(), found.channel.reset(), found.physicalCell.reset();
        list = nullptr;
    }

private:
    void gatherRow(const Observation& observation, const LeafUse& use);
};

/// Whether it is a zero in the place of a cell or channel that there is not.
[[nodiscard]] bool isZeroForNone(const Observation& observation, const LeafUse& use,
                                 const TechnologyTable& table);

} // namespace velmora

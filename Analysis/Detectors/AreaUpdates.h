// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Detectors/LeafRows.h"
#include "Analysis/Engine/Detector.h"
#include "Analysis/Picture/Technologies/DetectorTable.h"

#include <optional>
#include <span>
#include <string>
#include <vector>

namespace velmora {

/// Reports updates of location and routing areas that the states of mobility management go through, and how
/// they ended.
class AreaUpdatesDetector final : public Detector {
public:
    AreaUpdatesDetector(const Catalogue& catalogue, const DetectorTable& table);

    void report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) override;
    void interrupt(Time last, EventSink& sink) override;

private:
    struct Procedure {
        bool isUpdating = false;
        bool isStateKnown = false;
        std::optional<Time> since; ///< absent where its beginning was not seen
        MessageNumber message;     ///< that reported it first
        // Of this message:
        std::optional<std::int64_t> state;
        std::optional<std::int64_t> status;
        std::string statusText;
    };

    void update(const Observation& observation);
    void end(const AreaUpdateRow& row, const Procedure& procedure, const MessageReport& report,
             const RadioPicture& picture, EventSink& sink) const;

    std::span<const AreaUpdateRow> _rows;
    LeafRows _leaves;
    std::vector<Procedure> _procedures; ///< by row
    ObservedText _texts;
};

} // namespace velmora

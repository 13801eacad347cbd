// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Detectors/LeafRows.h"
#include "Analysis/Detectors/ReportedValue.h"
#include "Analysis/Engine/Detector.h"

#include <span>
#include <vector>

namespace velmora {

/// Reports updates of areas by what is stored when one was accepted, where no record has the procedure
/// itself.
class StoredAreasDetector final : public Detector {
public:
    StoredAreasDetector(const Catalogue& catalogue, const DetectorTable& table)
        : _rows(table.storedAreas), _leaves(catalogue), _stored(_rows.size()) {}

    void report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) override;
    void interrupt(Time last, EventSink& sink) override;

private:
    struct Stored {
        ReportedValue value;
        MessageNumber message; ///< that reported it last
    };

    std::span<const StoredAreaRow> _rows;
    LeafRows _leaves;
    std::vector<Stored> _stored; ///< by row
    ObservedText _texts;
};

} // namespace velmora

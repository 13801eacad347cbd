// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Detectors/LeafRows.h"
#include "Analysis/Detectors/ReportedValue.h"
#include "Analysis/Engine/Detector.h"

#include <span>
#include <string_view>

namespace velmora {

/// Reports that a SIM is another one than the last that was reported, also where there was none in between.
class SIMDetector final : public Detector {
public:
    SIMDetector(const Catalogue& catalogue, const DetectorTable& table)
        : _paths(table.sims), _leaves(catalogue) {}

    void report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) override;
    void interrupt(Time, EventSink&) override { _sim.forget(); }

private:
    std::span<const std::string_view> _paths;
    LeafRows _leaves;
    ReportedValue _sim;
    MessageNumber _message; ///< that reported it last
    ObservedText _texts;
};

} // namespace velmora

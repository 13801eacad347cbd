// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Detectors/LeafRows.h"
#include "Analysis/Engine/Detector.h"
#include "Analysis/Picture/Technologies/DetectorTable.h"

#include <optional>
#include <span>

namespace velmora {

/// Reports for how long there is no service, or only for emergency calls.
class ServiceDetector final : public Detector {
public:
    ServiceDetector(const Catalogue& catalogue, const DetectorTable& table)
        : _rows(table.services), _leaves(catalogue) {}

    void report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) override;
    void interrupt(Time last, EventSink& sink) override;

private:
    void end(std::optional<Time> time, EventSink& sink);

    std::span<const ServiceRow> _rows;
    LeafRows _leaves;
    Service _service = Service::Normal; ///< or not known
    std::optional<Event> _lasting;
};

} // namespace velmora

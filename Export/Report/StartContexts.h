// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Detectors/Contexts.h"
#include "Analysis/Events/EventSink.h"
#include "Analysis/MessageReport.h"
#include "Analysis/Picture/RadioPicture.h"

#include <string>
#include <vector>

namespace velmora {

class ReportEvents;

/// The packet-data contexts that were active when a recording began: the first list of contexts has them, and
/// they become events only when they end.
class StartContexts final : private EventSink {
public:
    struct Row {
        Time time{}; ///< of the message
        MessageNumber message;
        std::string text;
    };

    /// Both must outlive it.
    StartContexts(const Catalogue& catalogue, const ReportEvents& events);

    void report(const MessageReport& report, const RadioPicture& picture) {
        if (!_detector.hasRead())
            _detector.report(report, picture, *this);
    }
    [[nodiscard]] const std::vector<Row>& rows() const { return _rows; }

private:
    void happened(const Event& event) override;

    const ReportEvents& _events;
    ContextsDetector _detector;
    std::vector<Row> _rows;
};

} // namespace velmora

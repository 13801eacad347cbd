// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Engine/Detector.h"
#include "Analysis/Engine/RecordingChecks.h"
#include "Analysis/Events/EventSink.h"
#include "Analysis/MessageReport.h"
#include "Analysis/Picture/RadioPicture.h"
#include "LogGenerator/Observations/Catalogue.h"

#include <memory>
#include <string_view>
#include <vector>

namespace velmora {

/// Makes events of what the messages of one technology report: of a file, of several that follow each other,
/// or live. Its memory does not grow with their number.
class EventEngine {
public:
    /// With the detectors that are built in. Catalogue and sink must outlive it.
    EventEngine(const Catalogue& catalogue, EventSink& sink);
    EventEngine(const EventEngine&) = delete;
    EventEngine& operator=(const EventEngine&) = delete;

    /// Adds one that gets all further messages but malformed ones, after the earlier detectors.
    void add(std::unique_ptr<Detector> detector);

    /// Whether it uses what messages report of the leaf. Reports need not have anything else.
    [[nodiscard]] bool wants(const CatalogueField& leaf) const;
    /// The next message.
    void report(const MessageReport& report);
    /// The reader of the input found damage, such as a record of the file that is not whole, before the
    /// message of that number. Messages may be missing: what was known is not valid any more.
    void damaged(MessageNumber message, std::string_view reason);
    /// The recording has a comment on that message, which is the latest one reported.
    void noted(MessageNumber message, std::string_view text) { _checks.noted(message, text); }
    /// The connection that messages come by was lost: as damage, but no event.
    void interrupt();
    /// The input has ended.
    void finish();

    /// The latest time of the messages; absent before the first and after the end.
    [[nodiscard]] std::optional<Time> last() const { return _checks.last(); }
    /// What is known after the latest message.
    [[nodiscard]] const RadioPicture& picture() const { return _picture; }

private:
    RadioPicture _picture;
    EventSink& _sink;
    RecordingChecks _checks;
    std::vector<std::unique_ptr<Detector>> _detectors;
};

} // namespace velmora

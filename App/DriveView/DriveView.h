// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "App/DriveView/DriveButtons.h"
#include "App/DriveView/DriveCharts.h"
#include "App/DriveView/EventList.h"
#include "App/DriveView/NowView.h"
#include "Toolkit/Scrolling/PageView.h"
#include "Toolkit/Tables/GridView.h"

#include <string>

namespace velmora {

/// What a drive tester looks at, from top to bottom: the serving cell now, the neighbours, the drive over
/// time, the events. A page that scrolls where it is higher than its room.
class DriveView final : public PageView {
public:
    /// Both must outlive it; the source until another takes its place.
    DriveView(DriveSource& source, const Clock& clock);
    ~DriveView() override;

    void setSource(DriveSource& source);

    /// Shows what is known.
    void update();
    /// The same of events and charts, which cost more and are drawn less often.
    void updateEvents();
    void updateCharts();
    void layoutSubviews() override;

    [[nodiscard]] NowView& nowView() { return _now; }
    [[nodiscard]] DriveButtons& buttons() { return _buttons; }
    [[nodiscard]] GridView& neighbours() { return _neighbours; }
    [[nodiscard]] DriveCharts& charts() { return _charts; }
    [[nodiscard]] EventList& events() { return _events; }

private:
    [[nodiscard]] std::string latestChange() const;

    DriveSource* _source;
    NowView _now;
    DriveButtons _buttons;
    Label _neighboursHeading{"Neighbours"};
    GridView _neighbours;
    Label _chartsHeading{"Over time"};
    DriveCharts _charts;
    Label _eventsHeading{"Events"};
    EventList _events;
    const Clock& _clock;
    std::optional<RadioTechnology> _columnsOf;
    std::size_t _panels = 0;
};

} // namespace velmora

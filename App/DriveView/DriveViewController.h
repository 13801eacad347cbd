// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "App/DriveView/DriveView.h"
#include "Platform/MainQueue.h"
#include "Toolkit/Navigation/ViewController.h"

#include <memory>
#include <string>
#include <utility>

namespace velmora {

/// The drive view as a screen. While it is shown it takes over what is new some times a second; otherwise
/// nothing is drawn or computed.
class DriveViewController final : public ViewController {
public:
    /// How often numbers and lists are refreshed, and the charts, which hardly move in less.
    static constexpr std::chrono::milliseconds refreshInterval{250};
    static constexpr std::chrono::seconds chartInterval{2};

    /// All must outlive the controller; the source until another takes its place.
    DriveViewController(DriveSource& source, const Clock& clock, MainQueue& queue);
    ~DriveViewController() override;

    void viewWillAppear(bool animated) override;
    void viewWillDisappear(bool animated) override;
    bool becomeFirstResponder() override;
    void setSource(DriveSource& source);
    /// Of the view's buttons. Set before it is shown.
    void setActions(DriveButtons::Actions actions) { _actions = std::move(actions); }
    /// A recording has begun or ended.
    void recordingChanged();
    /// Shows everything as it is now.
    void refreshNow();
    /// Precondition: the view is loaded.
    [[nodiscard]] DriveView& driveView() { return static_cast<DriveView&>(view()); }

protected:
    [[nodiscard]] std::unique_ptr<View> loadView() override;

private:
    void refresh();
    void showCharts();

    DriveSource* _source;
    DriveButtons::Actions _actions;
    const Clock& _clock;
    MainQueue& _queue;
    std::unique_ptr<Timer> _timer;
    /// What the view shows.
    std::uint64_t _revision = 0;
    Time _second{};
    Time _charted{};
    std::string _shownLink;
};

} // namespace velmora

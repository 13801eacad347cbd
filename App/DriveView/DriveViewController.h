// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "App/DriveView/DriveView.h"
#include "Platform/MainQueue.h"
#include "Toolkit/Navigation/ViewController.h"

#include <functional>
#include <memory>
#include <string>

namespace velmora {

/// The drive view as a screen. While it is shown it takes over what is new some times a second; otherwise
/// nothing is drawn or computed.
class DriveViewController final : public ViewController {
public:
    /// How often numbers and lists are refreshed; the charts are once a second.
    static constexpr std::chrono::milliseconds refreshInterval{250};

    /// `link` says why no messages arrive; empty where they do. All must outlive the controller.
    DriveViewController(const DriveModel& model, const DriveHistory& history, const Clock& clock,
                        MainQueue& queue, std::function<std::string()> link);
    ~DriveViewController() override;

    void viewWillAppear(bool animated) override;
    void viewWillDisappear(bool animated) override;
    bool becomeFirstResponder() override;
    /// Shows everything as it is now.
    void refreshNow();
    /// Precondition: the view is loaded.
    [[nodiscard]] DriveView& driveView() { return static_cast<DriveView&>(view()); }

protected:
    [[nodiscard]] std::unique_ptr<View> loadView() override;

private:
    void refresh();

    const DriveModel& _model;
    const DriveHistory& _history;
    const Clock& _clock;
    MainQueue& _queue;
    std::function<std::string()> _link;
    std::unique_ptr<Timer> _timer;
    /// What the view shows.
    std::uint64_t _messages = 0;
    Time _second{};
    std::string _shownLink;
};

} // namespace velmora

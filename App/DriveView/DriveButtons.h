// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Button.h"
#include "Toolkit/View.h"

#include <functional>

namespace velmora {

/// What can be done during a drive, for a finger: record or stop that, note the moment, have a report made.
class DriveButtons final : public View {
public:
    struct Actions {
        std::function<void()> record; ///< starts or stops
        std::function<void()> bookmark;
        std::function<void()> report;
        std::function<bool()> isRecording;
    };
    static constexpr double height = 44;

    DriveButtons();
    ~DriveButtons() override;

    void setActions(Actions actions);
    /// Shows whether there is a recording now.
    void update();
    void layoutSubviews() override;

private:
    Actions _actions;
    Button _record{"Record"};
    Button _bookmark{"Bookmark"};
    Button _report{"Report\u2026"};
};

} // namespace velmora

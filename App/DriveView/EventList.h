// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Drive/DriveModel.h"
#include "App/DriveView/EventRows.h"
#include "Toolkit/Button.h"

#include <functional>
#include <memory>
#include <vector>

namespace velmora {

/// The events of a drive, the newest first, with a button for each severity that lists it or not.
class EventList final : public View {
public:
    /// Of more events only the newest are listed.
    static constexpr std::size_t mostRows = 5000;

    /// Both must outlive it, until another model takes the model's place.
    EventList(const DriveModel& model, const Clock& clock);
    ~EventList() override;

    void setOnChoose(std::function<void(Time)> choose) { _choose = std::move(choose); }
    void setModel(const DriveModel& model);
    void update();
    [[nodiscard]] double heightOfRows(std::size_t rows) const;
    void layoutSubviews() override;

private:
    void fill();

    const DriveModel* _model;
    const Clock& _clock;
    GridView _grid;
    std::vector<std::unique_ptr<Button>> _filters;
    std::vector<Time> _times; ///< of the rows
    std::function<void(Time)> _choose;
    std::uint64_t _revision = 0;
};

} // namespace velmora

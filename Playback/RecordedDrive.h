// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Drive/DriveModel.h"
#include "Playback/IndexPass.h"
#include "Playback/RecordingIndex.h"

#include <cstddef>
#include <string>
#include <string_view>

namespace velmora {

/// What the drive view shows of an entire recording, made while its index is: samples, events, bands. Main
/// thread only.
class RecordedDrive final : private IndexPass {
public:
    /// The oldest of more events are left out.
    static constexpr std::size_t mostEvents = 100'000;

    /// As DriveModel.
    RecordedDrive(DriveSamples& samples, const Clock& clock, DriveModel::RuleFiles rules);
    ~RecordedDrive() override;

    /// Begins with that index, of which nothing has been read yet. Pinned rows stay. It must outlive this, or
    /// be taken off with null.
    void setIndex(RecordingIndex* index);

    [[nodiscard]] DriveModel& model() { return _model; }
    [[nodiscard]] const DriveModel& model() const { return _model; }

    /// The first event after that time, and the last one before it; null where there is none.
    [[nodiscard]] const Event* after(Time time) const;
    [[nodiscard]] const Event* before(Time time) const;

private:
    void undecoded(Time arrival) override { _model.undecoded(arrival); }
    void noted(std::string_view text) override { _model.noted(text); }
    void damaged(std::string_view reason) override { _model.damaged(reason); }
    void finished() override { _model.finish(); }
    [[nodiscard]] PlayedPicture::Memory memory() const override;

    DriveModel _model;
    RecordingIndex* _index = nullptr;
};

} // namespace velmora

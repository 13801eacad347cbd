// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

#include <optional>

namespace velmora::C2K {

/// The running average of the 1x frame error rate as the state holds it under "TrafficFER": a fraction, in
/// single precision. It exists from the first frame of a traffic period to the first status outside one.
class FrameErrorAverage {
public:
    explicit FrameErrorAverage(Dictionary& state) : _state(state) {}

    /// The average; absent where the state holds none, or something that is no number.
    [[nodiscard]] std::optional<float> value() const;
    /// Adds one frame; returns the new average.
    float add(bool erased);
    void clear();

private:
    Dictionary& _state;
};

} // namespace velmora::C2K

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/OneX/FrameErrorAverage.h"

#include <string_view>

namespace velmora::C2K {

namespace {

constexpr std::string_view stateKey = "TrafficFER";
constexpr float newFrameWeight = 0.015625F; // 1/64
constexpr float averageWeight = 0.984375F;  // 63/64

} // namespace

std::optional<float> FrameErrorAverage::value() const {
    const Value& held = _state[stateKey];
    if (const double* real = held.asReal())
        return static_cast<float>(*real);
    if (const std::int64_t* integer = held.asInteger())
        return static_cast<float>(*integer);
    return std::nullopt;
}

float FrameErrorAverage::add(bool erased) {
    float average = (erased ? 1.0F : 0.0F) * newFrameWeight;
    if (const std::optional<float> old = value())
        average += *old * averageWeight;
    _state.set(stateKey, static_cast<double>(average));
    return average;
}

void FrameErrorAverage::clear() {
    _state.remove(stateKey);
}

} // namespace velmora::C2K

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Drive/DriveNow.h"

#include "Analysis/Picture/ChannelBand.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdio>
#include <string_view>

namespace velmora {

namespace {

std::string wholeNumber(double number) {
    return std::to_string(std::llround(number));
}

/// A level or quality, in the steps in which it was reported: "-83", "-11.5", "-80.25".
std::string decimalNumber(double number) {
    std::array<char, 32> text{};
    const int length = std::snprintf(text.data(), text.size(), "%.2f", number);
    std::string_view digits(text.data(), static_cast<std::size_t>(std::clamp(length, 0, 31)));
    while (digits.ends_with('0'))
        digits.remove_suffix(1);
    if (digits.ends_with('.'))
        digits.remove_suffix(1);
    return std::string(digits);
}

} // namespace

DriveNow driveNow(const RadioPicture& picture) {
    DriveNow now;
    now.technology = picture.technology();
    now.mode = picture.mode();
    const auto value = [&](Role role, auto text) -> std::optional<DriveValue> {
        const Reading* const found = picture.find(role);
        if (!found)
            return std::nullopt;
        now.reported = std::max(now.reported.value_or(found->time), found->time);
        return DriveValue{found->text.empty() ? text(found->number) : found->text, found->number,
                          found->time};
    };
    now.area = value(Role::ServingArea, wholeNumber);
    now.cell = value(Role::ServingCell, wholeNumber);
    now.channel = value(Role::ServingChannel, wholeNumber);
    now.physicalCell = value(Role::ServingPhysicalCell, wholeNumber);
    now.level = value(Role::ServingLevel, decimalNumber);
    now.quality = value(Role::ServingQuality, decimalNumber);
    if (const Reading* const state = picture.find(Role::RadioState))
        now.state = DriveValue{state->text, state->number, state->time};
    if (const std::string network = picture.serving().network; !network.empty())
        now.network = DriveValue{network, 0, picture.find(Role::ServingNetworkCode)->time};
    if (now.channel && now.technology)
        if (std::string band = bandOf(*now.technology, now.channel->number); !band.empty())
            now.band = DriveValue{std::move(band), 0, now.channel->time};
    return now;
}

} // namespace velmora

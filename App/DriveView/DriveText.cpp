// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/DriveView/DriveText.h"

#include "App/DateFormatter.h"
#include "Toolkit/Charts/ChartText.h"

#include <chrono>

namespace velmora {

namespace {

constexpr std::chrono::seconds minute{60};
constexpr std::chrono::seconds hour{3600};

} // namespace

std::string ageText(Time then, Time now) {
    const auto age = std::chrono::floor<std::chrono::seconds>(std::max(now - then, Time::duration::zero()));
    if (age < minute)
        return std::to_string(age.count()) + " s ago";
    if (age < hour)
        return std::to_string(age / minute) + " min ago";
    return std::to_string(age / hour) + " h ago";
}

bool isOld(Time then, Time now) {
    return now - then > DriveNow::freshness;
}

std::string numberText(std::string_view number) {
    return number.starts_with('-') ? "\u2212" + std::string(number.substr(1)) : std::string(number);
}

std::string numberText(double number) {
    std::string text = chartNumber(number, 2);
    while (text.ends_with('0'))
        text.pop_back();
    if (text.ends_with('.'))
        text.pop_back();
    return text;
}

Color colorOf(std::optional<LevelClass> levelClass) {
    if (!levelClass)
        return Color::automatic;
    switch (*levelClass) {
    case LevelClass::Poor: return Color::poor;
    case LevelClass::Fair: return Color::fair;
    case LevelClass::Good: return Color::good;
    case LevelClass::Excellent: break;
    }
    return Color::excellent;
}

std::string clockText(Time time, const Clock& clock) {
    return DateFormatter(clock, "HH:mm:ss").stringFromDate(time);
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Stats/FigureText.h"

#include "Tools/Decode/Samples/SampleText.h"

#include <cmath>
#include <cstdio>

namespace velmora {

namespace {

std::string fixedText(double number, int decimals) {
    char text[64];
    std::snprintf(text, sizeof text, "%.*f", decimals, number);
    return text;
}

} // namespace

std::string figureText(const std::optional<double>& number) {
    if (!number)
        return "-";
    constexpr double thousandths = 1000;
    constexpr double large = 1e12; // whose decimals mean nothing
    TextBuffer text;
    const double rounded = std::round(*number * thousandths) / thousandths;
    appendNumber(text, std::fabs(*number) < large ? rounded : *number);
    return std::string(text.view());
}

std::string figureText(double number, Unit unit) {
    const std::string_view name = nameOf(unit);
    return figureText(number) + (name.empty() ? "" : " " + std::string(name));
}

std::string secondsText(std::chrono::nanoseconds duration) {
    return fixedText(static_cast<double>(duration.count()) / 1e9, 3);
}

std::string shareText(std::chrono::nanoseconds part, std::chrono::nanoseconds whole) {
    if (whole.count() == 0)
        return "-";
    return fixedText(100 * static_cast<double>(part.count()) / static_cast<double>(whole.count()), 1) + " %";
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Mask/ReportText.h"

#include <cinttypes>
#include <cstdio>

namespace velmora {

namespace {

std::string codeText(std::uint32_t code) {
    char text[16];
    std::snprintf(text, sizeof text, "0x%04" PRIX32, code);
    return text;
}

/// A line for each class that there is.
std::string classLines(std::string_view begin, const MaskReport& report) {
    std::string text;
    for (std::size_t i = 0; i < maskedCount; ++i) {
        if (report.counts[i] == 0)
            continue;
        text.append(begin).append(maskedNames[i]).append(" ").append(std::to_string(report.counts[i]));
        if (static_cast<Masked>(i) == Masked::UnknownCode) {
            text += ":";
            for (const auto& [code, count] : report.unknownCodes)
                text += " " + codeText(code) + " " + std::to_string(count);
        }
        text += "\n";
    }
    return text;
}

} // namespace

std::string reportText(std::string_view title, const MaskReport& report) {
    std::string text(title);
    text += ": " + std::to_string(report.messages) + " messages, " + std::to_string(report.changed) +
            " changed, " + std::to_string(report.leftOut) + " left out\n";
    return text + classLines("  ", report);
}

std::string leftText(std::string_view title, const MaskReport& report) {
    return classLines(std::string(title) + ": in clear: ", report);
}

} // namespace velmora

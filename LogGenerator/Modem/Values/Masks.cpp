// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/Values/Masks.h"

#include "LogGenerator/Modem/Values/TypedValue.h"

#include <cstdio>
#include <span>
#include <string_view>

namespace velmora::LiveModem {

namespace {

struct MaskRow {
    std::uint32_t bits;
    std::string_view text;
};

constexpr MaskRow accessTechnologyRows[] = {
    {1u << 0, "POTS"},          {1u << 1, "GSM"},           {1u << 2, "GSM Compact"},
    {1u << 3, "GPRS"},          {1u << 4, "EDGE"},          {1u << 5, "UMTS"},
    {1u << 6, "HSDPA"},         {1u << 7, "HSUPA"},         {1u << 8, "HSPA"},
    {1u << 9, "HSPA+"},         {1u << 10, "1xRTT"},        {1u << 11, "EV-DO Rev. 0"},
    {1u << 12, "EV-DO Rev. A"}, {1u << 13, "EV-DO Rev. B"}, {1u << 14, "LTE"},
    {1u << 15, "5G NR"},        {1u << 16, "LTE Cat-M"},    {1u << 17, "NB-IoT"},
};
constexpr MaskRow capabilityRows[] = {
    {1u << 0, "POTS"},    {1u << 1, "CDMA/EV-DO"}, {1u << 2, "GSM/UMTS"}, {1u << 3, "LTE"},
    {1u << 5, "Iridium"}, {1u << 6, "5G NR"},      {1u << 7, "TD-SCDMA"},
};
constexpr MaskRow addressFamilyRows[] = {
    {1u << 0, "IPv4"}, {1u << 1, "IPv6"}, {1u << 2, "IPv4v6"}, {1u << 3, "non-IP"}};

constexpr double largestMask = 0xFFFFFFFF;

std::optional<std::string> textOfMask(const Value& value, std::span<const MaskRow> rows) {
    const auto mask = wholeNumberOf(value, {1, largestMask});
    if (!mask)
        return std::nullopt;
    auto rest = static_cast<std::uint32_t>(*mask);
    if (rest == 0xFFFFFFFF)
        return "any";
    std::string text;
    for (const MaskRow& row : rows)
        if ((rest & row.bits) != 0) {
            text.append(text.empty() ? "" : ", ").append(row.text);
            rest &= ~row.bits;
        }
    if (rest != 0) {
        char digits[16];
        std::snprintf(digits, sizeof digits, "0x%X", static_cast<unsigned>(rest));
        text.append(text.empty() ? "" : ", ").append(digits);
    }
    return text;
}

} // namespace

std::optional<std::string> accessTechnologies(const Value& mask) {
    return textOfMask(mask, accessTechnologyRows);
}

std::optional<std::string> capabilities(const Value& mask) {
    return textOfMask(mask, capabilityRows);
}

std::optional<std::string> addressFamilies(const Value& mask) {
    return textOfMask(mask, addressFamilyRows);
}

} // namespace velmora::LiveModem

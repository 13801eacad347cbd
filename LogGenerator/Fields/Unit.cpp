// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Fields/Unit.h"

namespace velmora {

namespace {

struct SuffixRow {
    std::string_view suffix;
    ShownUnit shown;
};

constexpr SuffixRow suffixes[] = {
    {"", {}},
    {" dBm", {Unit::DBm}},
    {" dB", {Unit::DB}},
    {"%", {Unit::Percent}},
    {"% (old)", {Unit::Percent}},
    {" kbps", {Unit::KilobitPerSecond, 1.024}}, // the display counts 1024 bits as a kilobit
    {" kbit/s", {Unit::KilobitPerSecond}},
    {" sec", {Unit::Second}},
    {" s", {Unit::Second}},
    {" MHz", {Unit::Megahertz}},
    {" bytes", {Unit::Byte}},
    {"\u00B0", {Unit::Degree}},
    {" m", {Unit::Metre}},
    {" \u00D7 64chips", {}}, // a PN offset, which is counted in these
};

} // namespace

std::string_view nameOf(Unit unit) {
    switch (unit) {
    case Unit::None: break;
    case Unit::DBm: return "dBm";
    case Unit::DB: return "dB";
    case Unit::Percent: return "%";
    case Unit::KilobitPerSecond: return "kbit/s";
    case Unit::Second: return "s";
    case Unit::Megahertz: return "MHz";
    case Unit::Byte: return "byte";
    case Unit::Degree: return "\u00B0";
    case Unit::Metre: return "m";
    }
    return {};
}

std::optional<ShownUnit> unitOfSuffix(std::string_view suffix) {
    for (const SuffixRow& row : suffixes)
        if (row.suffix == suffix)
            return row.shown;
    return std::nullopt;
}

} // namespace velmora

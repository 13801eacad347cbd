// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Picture/ChannelBand.h"

#include <cstdint>
#include <span>
#include <string_view>

namespace velmora {

namespace {

struct Range {
    std::uint32_t first;
    std::uint32_t last;
    std::string_view name;
};

/// 3GPP TS 45.005 2: ARFCN 512 to 810 are of both bands, and only the network says of which.
constexpr Range gsm[] = {
    {0, 124, "GSM 900"},    {128, 251, "GSM 850"},  {259, 293, "GSM 450"},
    {306, 340, "GSM 480"},  {438, 511, "GSM 750"},  {512, 810, "DCS 1800 or PCS 1900"},
    {811, 885, "DCS 1800"}, {955, 1023, "GSM 900"},
};

/// 3GPP TS 25.101 5.4.4, general UARFCN of the downlink.
constexpr Range umts[] = {
    {10562, 10838, "band 1 (2100 MHz)"}, {9662, 9938, "band 2 (1900 MHz)"},
    {1162, 1513, "band 3 (1800 MHz)"},   {1537, 1738, "band 4 (AWS)"},
    {4357, 4458, "band 5 (850 MHz)"},    {2237, 2563, "band 7 (2600 MHz)"},
    {2937, 3088, "band 8 (900 MHz)"},    {9237, 9387, "band 9 (1800 MHz)"},
    {3112, 3388, "band 10 (AWS)"},       {3712, 3787, "band 11 (1500 MHz)"},
    {3842, 3903, "band 12 (700 MHz)"},   {4017, 4043, "band 13 (700 MHz)"},
    {4117, 4143, "band 14 (700 MHz)"},   {712, 763, "band 19 (850 MHz)"},
    {4512, 4638, "band 20 (800 MHz)"},   {862, 912, "band 21 (1500 MHz)"},
    {4662, 5038, "band 22 (3500 MHz)"},  {5112, 5413, "band 25 (1900 MHz)"},
    {5762, 5913, "band 26 (850 MHz)"},
};

/// 3GPP TS 25.102 5.4.3: five a megahertz.
constexpr Range tdscdma[] = {
    {9404, 9503, "band f (1880 MHz)"},   {9504, 9596, "band a or f (1900 MHz)"},
    {10054, 10121, "band a (2010 MHz)"}, {11504, 11996, "band e (2300 MHz)"},
    {12854, 13096, "band d (2600 MHz)"},
};

/// 3GPP TS 36.101 5.7.3, EARFCN of the downlink.
constexpr Range lte[] = {
    {0, 599, "band 1 (2100 MHz)"},        {600, 1199, "band 2 (1900 MHz)"},
    {1200, 1949, "band 3 (1800 MHz)"},    {1950, 2399, "band 4 (AWS)"},
    {2400, 2649, "band 5 (850 MHz)"},     {2650, 2749, "band 6 (850 MHz)"},
    {2750, 3449, "band 7 (2600 MHz)"},    {3450, 3799, "band 8 (900 MHz)"},
    {3800, 4149, "band 9 (1800 MHz)"},    {4150, 4749, "band 10 (AWS)"},
    {4750, 4949, "band 11 (1500 MHz)"},   {5010, 5179, "band 12 (700 MHz)"},
    {5180, 5279, "band 13 (700 MHz)"},    {5280, 5379, "band 14 (700 MHz)"},
    {5730, 5849, "band 17 (700 MHz)"},    {5850, 5999, "band 18 (850 MHz)"},
    {6000, 6149, "band 19 (850 MHz)"},    {6150, 6449, "band 20 (800 MHz)"},
    {6450, 6599, "band 21 (1500 MHz)"},   {6600, 7399, "band 22 (3500 MHz)"},
    {7500, 7699, "band 23 (2000 MHz)"},   {7700, 8039, "band 24 (1600 MHz)"},
    {8040, 8689, "band 25 (1900 MHz)"},   {8690, 9039, "band 26 (850 MHz)"},
    {9040, 9209, "band 27 (850 MHz)"},    {9210, 9659, "band 28 (700 MHz)"},
    {9660, 9769, "band 29 (700 MHz)"},    {9770, 9869, "band 30 (2300 MHz)"},
    {9870, 9919, "band 31 (450 MHz)"},    {9920, 10359, "band 32 (1500 MHz)"},
    {36000, 36199, "band 33 (1900 MHz)"}, {36200, 36349, "band 34 (2000 MHz)"},
    {36350, 36949, "band 35 (1900 MHz)"}, {36950, 37549, "band 36 (1900 MHz)"},
    {37550, 37749, "band 37 (1900 MHz)"}, {37750, 38249, "band 38 (2600 MHz)"},
    {38250, 38649, "band 39 (1900 MHz)"}, {38650, 39649, "band 40 (2300 MHz)"},
    {39650, 41589, "band 41 (2500 MHz)"}, {41590, 43589, "band 42 (3500 MHz)"},
    {43590, 45589, "band 43 (3700 MHz)"}, {45590, 46589, "band 44 (700 MHz)"},
    {46590, 46789, "band 45 (1500 MHz)"}, {46790, 54539, "band 46 (5 GHz)"},
    {65536, 66435, "band 65 (2100 MHz)"}, {66436, 67335, "band 66 (AWS)"},
    {67336, 67535, "band 67 (700 MHz)"},  {67536, 67835, "band 68 (700 MHz)"},
    {67836, 68335, "band 69 (2600 MHz)"}, {68336, 68585, "band 70 (2000 MHz)"},
    {68586, 68935, "band 71 (600 MHz)"},
};

std::span<const Range> rangesOf(RadioTechnology technology) {
    switch (technology) {
    case RadioTechnology::GSM: return gsm;
    case RadioTechnology::UMTS: return umts;
    case RadioTechnology::TDSCDMA: return tdscdma;
    case RadioTechnology::LTE: return lte;
    case RadioTechnology::NR: // its bands overlap
    case RadioTechnology::CDMA1x:
    case RadioTechnology::EVDO: break;
    }
    return {};
}

} // namespace

std::string bandOf(RadioTechnology technology, double channel) {
    for (const Range& each : rangesOf(technology))
        if (channel >= each.first && channel <= each.last)
            return std::string(each.name);
    return {};
}

} // namespace velmora

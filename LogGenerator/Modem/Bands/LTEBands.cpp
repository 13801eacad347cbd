// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/Bands/LTEBands.h"

#include "LogGenerator/Modem/Bands/Uplink.h"

namespace velmora::Bands {
namespace {

/// Consecutive downlink numbers of a band, 100 kHz apart.
struct Band {
    std::string_view name;
    std::int32_t first;
    std::int32_t last;
    std::int32_t lowest_kHz; ///< of the downlink, and so of its first number
    Uplink uplink;

    [[nodiscard]] bool hasNumber(std::int64_t earfcn) const { return earfcn >= first && earfcn <= last; }
    [[nodiscard]] bool hasFrequency(std::int32_t kHz) const {
        return kHz >= lowest_kHz && kHz <= lowest_kHz + 100 * (last - first);
    }
};

// Bands 24 and 70 have two separations of downlink and uplink each.
constexpr Band bands[] = {
    {"1", 0, 599, 2'110'000, {1'920'000, 1'979'900}},
    {"2", 600, 1199, 1'930'000, {1'850'000, 1'909'900}},
    {"3", 1200, 1949, 1'805'000, {1'710'000, 1'784'900}},
    {"4", 1950, 2399, 2'110'000, {1'710'000, 1'754'900}},
    {"5", 2400, 2649, 869'000, {824'000, 848'900}},
    {"6", 2650, 2749, 875'000, {830'000, 839'900}},
    {"7", 2750, 3449, 2'620'000, {2'500'000, 2'569'900}},
    {"8", 3450, 3799, 925'000, {880'000, 914'900}},
    {"9", 3800, 4149, 1'844'900, {1'749'900, 1'784'800}},
    {"10", 4150, 4749, 2'110'000, {1'710'000, 1'769'900}},
    {"11", 4750, 4949, 1'475'900, {1'427'900, 1'447'800}},
    {"12", 5010, 5179, 729'000, {699'000, 715'900}},
    {"13", 5180, 5279, 746'000, {777'000, 786'900}},
    {"14", 5280, 5379, 758'000, {788'000, 797'900}},
    {"17", 5730, 5849, 734'000, {704'000, 715'900}},
    {"18", 5850, 5999, 860'000, {815'000, 829'900}},
    {"19", 6000, 6149, 875'000, {830'000, 844'900}},
    {"20", 6150, 6449, 791'000, {832'000, 861'900}},
    {"21", 6450, 6599, 1'495'900, {1'447'900, 1'462'800}},
    {"22", 6600, 7399, 3'510'000, {3'410'000, 3'489'900}},
    {"23", 7500, 7699, 2'180'000, {2'000'000, 2'019'900}},
    {"24", 7700, 8039, 1'525'000, severalUplinks},
    {"25", 8040, 8689, 1'930'000, {1'850'000, 1'914'900}},
    {"26", 8690, 9039, 859'000, {814'000, 848'900}},
    {"27", 9040, 9209, 852'000, {807'000, 823'900}},
    {"28", 9210, 9659, 758'000, {703'000, 747'900}},
    {"29", 9660, 9769, 717'000, noUplink},
    {"30", 9770, 9869, 2'350'000, {2'305'000, 2'314'900}},
    {"31", 9870, 9919, 462'500, {452'500, 457'400}},
    {"32", 9920, 10359, 1'452'000, noUplink},
    {"33", 36000, 36199, 1'900'000, timeDivision},
    {"34", 36200, 36349, 2'010'000, timeDivision},
    {"35", 36350, 36949, 1'850'000, timeDivision},
    {"36", 36950, 37549, 1'930'000, timeDivision},
    {"37", 37550, 37749, 1'910'000, timeDivision},
    {"38", 37750, 38249, 2'570'000, timeDivision},
    {"39", 38250, 38649, 1'880'000, timeDivision},
    {"40", 38650, 39649, 2'300'000, timeDivision},
    {"41", 39650, 41589, 2'496'000, timeDivision},
    {"42", 41590, 43589, 3'400'000, timeDivision},
    {"43", 43590, 45589, 3'600'000, timeDivision},
    {"44", 45590, 46589, 703'000, timeDivision},
    {"45", 46590, 46789, 1'447'000, timeDivision},
    {"46", 46790, 54539, 5'150'000, timeDivision},
    {"47", 54540, 55239, 5'855'000, timeDivision},
    {"48", 55240, 56739, 3'550'000, timeDivision},
    {"49", 56740, 58239, 3'550'000, timeDivision},
    {"50", 58240, 59089, 1'432'000, timeDivision},
    {"51", 59090, 59139, 1'427'000, timeDivision},
    {"52", 59140, 60139, 3'300'000, timeDivision},
    {"53", 60140, 60254, 2'483'500, timeDivision},
    {"54", 60255, 60304, 1'670'000, timeDivision},
    {"65", 65536, 66435, 2'110'000, {1'920'000, 2'009'900}},
    {"66", 66436, 67335, 2'110'000, {1'710'000, 1'779'900}},
    {"67", 67336, 67535, 738'000, noUplink},
    {"68", 67536, 67835, 753'000, {698'000, 727'900}},
    {"69", 67836, 68335, 2'570'000, noUplink},
    {"70", 68336, 68585, 1'995'000, severalUplinks},
    {"71", 68586, 68935, 617'000, {663'000, 697'900}},
    {"72", 68936, 68985, 461'000, {451'000, 455'900}},
    {"73", 68986, 69035, 460'000, {450'000, 454'900}},
    {"74", 69036, 69465, 1'475'000, {1'427'000, 1'469'900}},
    {"75", 69466, 70315, 1'432'000, noUplink},
    {"76", 70316, 70365, 1'427'000, noUplink},
    {"85", 70366, 70545, 728'000, {698'000, 715'900}},
    {"87", 70546, 70595, 420'000, {410'000, 414'900}},
    {"88", 70596, 70645, 422'000, {412'000, 416'900}},
    {"103", 70646, 70655, 757'000, {787'000, 787'900}},
    {"106", 70656, 70705, 935'000, {896'000, 900'900}},
};

} // namespace

Carrier carrierOfEARFCN(std::int64_t earfcn) {
    Carrier carrier;
    for (const Band& band : bands) {
        if (!band.hasNumber(earfcn))
            continue;
        const std::int32_t distance = 100 * (static_cast<std::int32_t>(earfcn) - band.first);
        const std::int32_t downlink = band.lowest_kHz + distance;
        carrier.add({band.name, downlink, band.uplink.pairedWith(distance)});
        for (const Band& other : bands)
            if (&other != &band && other.hasFrequency(downlink) &&
                other.uplink.isTimeDivision() == band.uplink.isTimeDivision())
                carrier.addOverlapping(other.name);
    }
    return carrier;
}

} // namespace velmora::Bands

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/Bands/NRBands.h"

#include "LogGenerator/Modem/Bands/Uplink.h"

namespace velmora::Bands {
namespace {

/// A part of the global raster (3GPP TS 38.104, table 5.4.2.1-1).
struct Raster {
    std::int32_t first;
    std::int32_t last;
    std::int32_t step_kHz;
    std::int32_t lowest_kHz;
};
constexpr Raster rasters[] = {
    {0, 599'999, 5, 0},
    {600'000, 2'016'666, 15, 3'000'000},
    {2'016'667, 3'279'165, 60, 24'250'080},
};

/// A band by the edges of its downlink, which belong to it.
struct Band {
    std::string_view name;
    std::int32_t lowest_kHz;
    std::int32_t highest_kHz;
    Uplink uplink;
};

// Bands 24, 70, 91 to 94 and 109 have several separations of downlink and uplink, or none that is fixed.
// Supplementary uplinks (80 to 84, 86, 89, 95, 97 to 99) have no downlink.
constexpr Band bands[] = {
    {"n1", 2'110'000, 2'170'000, {1'920'000, 1'980'000}},
    {"n2", 1'930'000, 1'990'000, {1'850'000, 1'910'000}},
    {"n3", 1'805'000, 1'880'000, {1'710'000, 1'785'000}},
    {"n5", 869'000, 894'000, {824'000, 849'000}},
    {"n7", 2'620'000, 2'690'000, {2'500'000, 2'570'000}},
    {"n8", 925'000, 960'000, {880'000, 915'000}},
    {"n12", 729'000, 746'000, {699'000, 716'000}},
    {"n13", 746'000, 756'000, {777'000, 787'000}},
    {"n14", 758'000, 768'000, {788'000, 798'000}},
    {"n18", 860'000, 875'000, {815'000, 830'000}},
    {"n20", 791'000, 821'000, {832'000, 862'000}},
    {"n24", 1'525'000, 1'559'000, severalUplinks},
    {"n25", 1'930'000, 1'995'000, {1'850'000, 1'915'000}},
    {"n26", 859'000, 894'000, {814'000, 849'000}},
    {"n28", 758'000, 803'000, {703'000, 748'000}},
    {"n29", 717'000, 728'000, noUplink},
    {"n30", 2'350'000, 2'360'000, {2'305'000, 2'315'000}},
    {"n31", 462'500, 467'500, {452'500, 457'500}},
    {"n34", 2'010'000, 2'025'000, timeDivision},
    {"n38", 2'570'000, 2'620'000, timeDivision},
    {"n39", 1'880'000, 1'920'000, timeDivision},
    {"n40", 2'300'000, 2'400'000, timeDivision},
    {"n41", 2'496'000, 2'690'000, timeDivision},
    {"n46", 5'150'000, 5'925'000, timeDivision},
    {"n47", 5'855'000, 5'925'000, timeDivision},
    {"n48", 3'550'000, 3'700'000, timeDivision},
    {"n50", 1'432'000, 1'517'000, timeDivision},
    {"n51", 1'427'000, 1'432'000, timeDivision},
    {"n53", 2'483'500, 2'495'000, timeDivision},
    {"n54", 1'670'000, 1'675'000, timeDivision},
    {"n65", 2'110'000, 2'200'000, {1'920'000, 2'010'000}},
    {"n66", 2'110'000, 2'200'000, {1'710'000, 1'780'000}},
    {"n67", 738'000, 758'000, noUplink},
    {"n68", 753'000, 783'000, {698'000, 728'000}},
    {"n70", 1'995'000, 2'020'000, severalUplinks},
    {"n71", 617'000, 652'000, {663'000, 698'000}},
    {"n72", 461'000, 466'000, {451'000, 456'000}},
    {"n74", 1'475'000, 1'518'000, {1'427'000, 1'470'000}},
    {"n75", 1'432'000, 1'517'000, noUplink},
    {"n76", 1'427'000, 1'432'000, noUplink},
    {"n77", 3'300'000, 4'200'000, timeDivision},
    {"n78", 3'300'000, 3'800'000, timeDivision},
    {"n79", 4'400'000, 5'000'000, timeDivision},
    {"n85", 728'000, 746'000, {698'000, 716'000}},
    {"n87", 420'000, 425'000, {410'000, 415'000}},
    {"n88", 422'000, 427'000, {412'000, 417'000}},
    {"n90", 2'496'000, 2'690'000, timeDivision},
    {"n91", 1'427'000, 1'432'000, severalUplinks},
    {"n92", 1'432'000, 1'517'000, severalUplinks},
    {"n93", 1'427'000, 1'432'000, severalUplinks},
    {"n94", 1'432'000, 1'517'000, severalUplinks},
    {"n96", 5'925'000, 7'125'000, timeDivision},
    {"n100", 919'400, 925'000, {874'400, 880'000}},
    {"n101", 1'900'000, 1'910'000, timeDivision},
    {"n102", 5'925'000, 6'425'000, timeDivision},
    {"n104", 6'425'000, 7'125'000, timeDivision},
    {"n105", 612'000, 652'000, {663'000, 703'000}},
    {"n106", 935'000, 940'000, {896'000, 901'000}},
    {"n109", 1'432'000, 1'517'000, severalUplinks},
    {"n257", 26'500'000, 29'500'000, timeDivision},
    {"n258", 24'250'000, 27'500'000, timeDivision},
    {"n259", 39'500'000, 43'500'000, timeDivision},
    {"n260", 37'000'000, 40'000'000, timeDivision},
    {"n261", 27'500'000, 28'350'000, timeDivision},
    {"n262", 47'200'000, 48'200'000, timeDivision},
    {"n263", 57'000'000, 71'000'000, timeDivision},
};

} // namespace

Carrier carrierOfNRARFCN(std::int64_t nrarfcn) {
    for (const Raster& raster : rasters) {
        if (nrarfcn < raster.first || nrarfcn > raster.last)
            continue;
        const std::int32_t steps = static_cast<std::int32_t>(nrarfcn) - raster.first;
        const std::int32_t downlink = raster.lowest_kHz + raster.step_kHz * steps;
        Carrier carrier(downlink);
        for (const Band& band : bands)
            if (downlink >= band.lowest_kHz && downlink <= band.highest_kHz)
                carrier.add({band.name, downlink, band.uplink.pairedWith(downlink - band.lowest_kHz)});
        return carrier;
    }
    return {};
}

} // namespace velmora::Bands

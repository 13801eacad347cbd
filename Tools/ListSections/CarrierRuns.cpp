// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/ListSections/CarrierRuns.h"

#include "LogGenerator/Modem/Bands/GSMBands.h"
#include "LogGenerator/Modem/Bands/LTEBands.h"
#include "LogGenerator/Modem/Bands/NRBands.h"
#include "LogGenerator/Modem/Bands/TDSCDMABands.h"
#include "LogGenerator/Modem/Bands/UMTSBands.h"
#include "LogGenerator/Modem/Cells/CellRanges.h"
#include "LogGenerator/Modem/Cells/ReportedCell.h"
#include "Tools/ListSections/LuaText.h"

#include <cmath>
#include <cstdint>
#include <optional>

namespace velmora {

namespace {

using LiveModem::RadioTechnology;
namespace CellRange = LiveModem::CellRange;

std::optional<std::int64_t> kilohertz(const std::optional<double>& MHz) {
    return MHz ? std::optional<std::int64_t>(std::llround(*MHz * 1000)) : std::nullopt;
}

/// A frequency that ascends from channel to channel; constant in a run of one.
struct Ramp {
    std::optional<std::int64_t> first_kHz;
    std::int64_t step_kHz = 0;

    /// Whether the frequency continues it after so many channels.
    [[nodiscard]] bool goesOn(const std::optional<std::int64_t>& kHz, std::int64_t channels) {
        if (!kHz || !first_kHz)
            return kHz.has_value() == first_kHz.has_value();
        if (channels == 1)
            step_kHz = *kHz - *first_kHz;
        return *kHz == *first_kHz + step_kHz * channels;
    }
    [[nodiscard]] std::string text() const {
        return first_kHz ? std::to_string(*first_kHz) + "," + std::to_string(step_kHz) : "false,0";
    }
};

struct Run {
    std::int64_t first;
    std::string bands;
    std::string overlapping;
    Ramp downlink;
    Ramp uplink;

    Run(std::int64_t channel, const Bands::Carrier& carrier)
        : first(channel), downlink{kilohertz(carrier.downlink_MHz())}, uplink{
                                                                           kilohertz(carrier.uplink_MHz())} {
        for (const Bands::CarrierBand& each : carrier.bands())
            bands.append(bands.empty() ? "" : ", ").append(each.name);
        for (const std::string_view each : carrier.overlapping())
            overlapping.append(overlapping.empty() ? "" : ", ").append(each);
    }
    /// Whether the next run, of one channel, is part of this one.
    [[nodiscard]] bool goesOn(const Run& next) {
        const std::int64_t channels = next.first - first;
        return bands == next.bands && overlapping == next.overlapping &&
               downlink.goesOn(next.downlink.first_kHz, channels) &&
               uplink.goesOn(next.uplink.first_kHz, channels);
    }
    /// Nothing of a number that has no meaning.
    [[nodiscard]] std::string text(std::int64_t last) const {
        if (bands.empty() && !downlink.first_kHz)
            return {};
        return "        {" + std::to_string(first) + "," + std::to_string(last) + "," + luaString(bands) +
               "," + luaString(overlapping) + "," + downlink.text() + "," + uplink.text() + "},\n";
    }
};

std::string runsOf(RadioTechnology technology, Bands::Carrier (*carrierOf)(std::int64_t),
                   const LiveModem::Range& channels) {
    std::string table = "      [" + std::to_string(static_cast<int>(technology)) + "]={\n";
    const auto last = static_cast<std::int64_t>(channels.most);
    Run run(0, carrierOf(0));
    for (std::int64_t channel = 1; channel <= last; ++channel) {
        Run next(channel, carrierOf(channel));
        if (run.goesOn(next))
            continue;
        table += run.text(channel - 1);
        run = std::move(next);
    }
    return table + run.text(last) + "      },\n";
}

} // namespace

std::string carrierRuns() {
    return "    carriers={\n" + runsOf(RadioTechnology::GSM, Bands::carrierOfARFCN, CellRange::arfcn) +
           runsOf(RadioTechnology::UMTS, Bands::carrierOfUARFCN, CellRange::uarfcn) +
           runsOf(RadioTechnology::TDSCDMA, Bands::carrierOfTDDUARFCN, CellRange::uarfcn) +
           runsOf(RadioTechnology::LTE, Bands::carrierOfEARFCN, CellRange::earfcn) +
           runsOf(RadioTechnology::NR, Bands::carrierOfNRARFCN, CellRange::nrarfcn) + "    },\n";
}

} // namespace velmora

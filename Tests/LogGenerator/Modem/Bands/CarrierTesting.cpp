// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/Modem/Bands/CarrierTesting.h"

#include <gtest/gtest.h>

#include <limits>
#include <string>
#include <vector>

namespace velmora::Bands {
namespace {

void append(std::string& names, std::string_view name) {
    names += names.empty() ? "" : " ";
    names += name;
}

} // namespace

void expectCarriers(Carrier (*carrierOf)(std::int64_t), std::span<const CarrierRow> rows) {
    for (const CarrierRow& row : rows) {
        SCOPED_TRACE(row.number);
        const Carrier carrier = carrierOf(row.number);
        std::string bands;
        for (const CarrierBand& band : carrier.bands())
            append(bands, band.name);
        EXPECT_EQ(bands, row.bands);
        std::string overlapping;
        for (const std::string_view band : carrier.overlapping())
            append(overlapping, band);
        EXPECT_EQ(overlapping, row.overlapping);
        EXPECT_DOUBLE_EQ(carrier.downlink_MHz().value_or(0), row.downlink_MHz);
        EXPECT_DOUBLE_EQ(carrier.uplink_MHz().value_or(0), row.uplink_MHz);
    }
}

void expectNoCarriers(Carrier (*carrierOf)(std::int64_t), std::span<const std::int64_t> numbers) {
    std::vector<std::int64_t> all(numbers.begin(), numbers.end());
    all.push_back(std::numeric_limits<std::int64_t>::min());
    all.push_back(std::numeric_limits<std::int64_t>::max());
    for (const std::int64_t number : all) {
        SCOPED_TRACE(number);
        const Carrier carrier = carrierOf(number);
        EXPECT_TRUE(carrier.bands().empty());
        EXPECT_TRUE(carrier.overlapping().empty());
        EXPECT_EQ(carrier.downlink_MHz(), std::nullopt);
        EXPECT_EQ(carrier.uplink_MHz(), std::nullopt);
    }
}

} // namespace velmora::Bands

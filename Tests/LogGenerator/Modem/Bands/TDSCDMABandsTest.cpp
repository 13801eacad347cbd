// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/Bands/TDSCDMABands.h"
#include "Tests/LogGenerator/Modem/Bands/CarrierTesting.h"

#include <gtest/gtest.h>

namespace velmora::Bands {
namespace {

/// The edges of the bands of 3GPP TS 25.102, 5.2, with half a carrier of 1.6 MHz inside them.
constexpr CarrierRow carriers[] = {
    {9404, "b f", 1880.8, 0},   {9503, "b f", 1900.6, 0}, {9504, "a b f", 1900.8, 0},
    {9546, "a b f", 1909.2, 0}, {9547, "a f", 1909.4, 0}, {9554, "a c f", 1910.8, 0},
    {9596, "a c f", 1919.2, 0}, {9597, "c", 1919.4, 0},   {9646, "c", 1929.2, 0},
    {9654, "b", 1930.8, 0},     {9946, "b", 1989.2, 0},   {10054, "a", 2010.8, 0},
    {10121, "a", 2024.2, 0},    {11504, "e", 2300.8, 0},  {11996, "e", 2399.2, 0},
    {12854, "d", 2570.8, 0},    {13096, "d", 2619.2, 0},  {9254, "b", 1850.8, 0},
};

TEST(TDSCDMABands, KnowTheFirstAndTheLastChannelOfEachBand) {
    expectCarriers(carrierOfTDDUARFCN, carriers);
}

TEST(TDSCDMABands, KnowNothingOfOtherNumbers) {
    constexpr std::int64_t others[] = {-1,    0,     9253,  9647,  9653,  9947,
                                       10053, 10122, 11503, 11997, 12853, 13097};
    expectNoCarriers(carrierOfTDDUARFCN, others);
}

} // namespace
} // namespace velmora::Bands

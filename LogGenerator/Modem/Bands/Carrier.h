// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>
#include <string_view>

namespace velmora::Bands {

/// A band that a channel number can mean, with the frequencies that the number has in it.
struct CarrierBand {
    std::string_view name; ///< as its standard writes it: "DCS 1800", "VIII", "20", "n78"; never freed
    std::int32_t downlink_kHz = 0;
    /// Of a band with an uplink of its own (FDD), where the standard pairs the channel with a single one.
    std::optional<std::int32_t> uplink_kHz;
};

/// The bands and frequencies that a channel number means. The numbers of the standards are not unique: one
/// can lie in several bands, at times with other frequencies in each. Allocates nothing.
class Carrier {
public:
    /// More than any number has, and than overlap with any.
    static constexpr std::size_t maximumBands = 10;

    Carrier() = default;
    /// A carrier of known frequency that may lie in no band.
    explicit Carrier(std::int32_t downlink_kHz) : _downlink_kHz(downlink_kHz) {}

    /// Bands past the maximum are left out.
    void add(const CarrierBand& band);
    void addOverlapping(std::string_view band);

    /// The bands that the number can mean, in the order of the standard; none where it has no meaning.
    [[nodiscard]] std::span<const CarrierBand> bands() const { return {_bands.data(), _count}; }
    /// Other bands, by name, in which the same frequency has another number.
    [[nodiscard]] std::span<const std::string_view> overlapping() const {
        return {_overlapping.data(), _overlappingCount};
    }
    /// The frequency of the carrier's centre, in MHz; none where the number has no meaning, or several
    /// frequencies.
    [[nodiscard]] std::optional<double> downlink_MHz() const;
    /// The centre of the uplink carrier that it is paired with, in MHz; none where one of the bands has none,
    /// or another.
    [[nodiscard]] std::optional<double> uplink_MHz() const;

private:
    std::array<CarrierBand, maximumBands> _bands;
    std::array<std::string_view, maximumBands> _overlapping;
    std::size_t _count = 0;
    std::size_t _overlappingCount = 0;
    std::optional<std::int32_t> _downlink_kHz; ///< that no band has to tell
};

} // namespace velmora::Bands

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace velmora::LiveModem {

/// The radio technologies of cells; the numbers are observed.
enum class RadioTechnology : std::uint8_t { GSM = 1, UMTS = 2, TDSCDMA = 3, LTE = 4, NR = 5, CDMA2000 = 6 };

/// A set of them, a bit each.
using RadioTechnologies = std::uint8_t;
[[nodiscard]] constexpr RadioTechnologies bitOf(RadioTechnology technology) {
    return static_cast<RadioTechnologies>(1u << static_cast<unsigned>(technology));
}

/// One cell of a message. A view: the message has to outlive it.
struct ReportedCell {
    const Dictionary* values;
    RadioTechnology technology;
    /// The network's place, known by its identity: there is no measurement.
    bool isPlace = false;

    /// dBm; absent where the message has none, and of CDMA2000, whose pilots are compared in dB.
    [[nodiscard]] std::optional<double> level() const;
};

/// The cells of a message, serving ones and neighbours, each in the message's order.
struct ReportedCells {
    std::vector<ReportedCell> serving;
    std::vector<ReportedCell> neighbors;
    std::size_t count = 0; ///< of the message's entries, those included that are no cell
};
[[nodiscard]] ReportedCells cellsOf(const Dictionary& message);

/// The network of a cell or SIM: "001-01"; the codes as texts. Each is absent where the number is none.
struct Network {
    std::optional<std::string> countryCode;
    std::optional<std::string> networkCode;
    [[nodiscard]] std::optional<std::string> text() const;
};
[[nodiscard]] Network networkOf(const Dictionary& cell);
/// "001-01" of five or six digits in a row; absent for another text.
[[nodiscard]] std::optional<std::string> networkText(const Value& digits);

} // namespace velmora::LiveModem

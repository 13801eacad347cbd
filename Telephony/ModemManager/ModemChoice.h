// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

struct Modem;

/// Which modem to follow; any where nothing is set. What is set has to fit, all of it.
struct ModemChoice {
    std::optional<std::uint32_t> index;
    std::string equipment; ///< its IMEI, MEID or ESN
    std::string path;      ///< of its device in the system, or of its object
    std::string sim;       ///< the ICCID of its active SIM, or the path of that object

    /// Takes what people write: an index, an equipment identity, or a path; a SIM's ICCID or its path. The
    /// reason says what was expected.
    Result<Done> setModem(std::string_view text);
    Result<Done> setSIM(std::string_view text);

    [[nodiscard]] bool isAny() const { return !index && equipment.empty() && path.empty() && sim.empty(); }
    /// Whether the SIM is chosen by its ICCID, which has to be asked for.
    [[nodiscard]] bool needsICCID() const { return !sim.empty() && !sim.starts_with('/'); }
    /// The choice as a log line names it: "modem 7", "modem with the chosen SIM".
    [[nodiscard]] std::string description() const;

    friend bool operator==(const ModemChoice&, const ModemChoice&) = default;
};

/// What a modem is recognised by when it comes back under another index: its equipment identity or, without
/// one, its device's path. Empty where it has neither.
[[nodiscard]] std::string identityOf(const Modem& modem);

/// Whether the modem is the chosen one. `identity` replaces the index where it is not empty; `iccid` is that
/// of the modem's active SIM, empty where it is not known.
[[nodiscard]] bool fits(const ModemChoice& choice, const Modem& modem, std::string_view identity,
                        std::string_view iccid);

} // namespace velmora

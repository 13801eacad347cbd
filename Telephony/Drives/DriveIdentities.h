// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstdint>
#include <string>
#include <utility>
#include <vector>

namespace velmora {

/// What a drive's messages hold that identifies the subscriber, the SIM or the equipment. By default it is
/// that of a test network, whose numbers and addresses are reserved for tests and documents.
struct DriveIdentities {
    struct SIM {
        std::string iccid;
        std::string imsi;
        std::string number; ///< in groups of digits
    };

    std::array<SIM, 2> sims = {{{"8900101000000000017", "001010000000017", "+1 555 0100"},
                                {"8900102000000000025", "001020000000025", "+1 555 0101"}}};
    std::string mailbox = "+1 555 0199";
    std::string eid = "89001000000000000000000000000099";
    std::string equipment = "001010999999990"; ///< no maker's, and its check digit is wrong
    /// What addresses begin with, of both versions: those of contexts and name servers, and of bearers.
    std::string addresses = "192.0.2.";
    std::string addresses6 = "2001:db8::";
    std::string bearerAddresses = "198.51.100.";
    std::string bearerAddresses6 = "2001:db8:0:1::";

    /// Random ones, which look like those of a subscriber. The SIMs' networks are those of the test network.
    [[nodiscard]] static DriveIdentities random(std::uint64_t seed);

    /// Each identity as a text; of the addresses what they begin with.
    [[nodiscard]] std::vector<std::string> texts() const;
};

/// Makes a scenario's phone as it is at first, but for its identities.
template <class Phone>
void restart(Phone& phone) {
    Phone first{};
    first.identities = std::move(phone.identities);
    phone = std::move(first);
}

/// A phone number without the spaces between its groups.
[[nodiscard]] std::string withoutSpaces(std::string number);

} // namespace velmora

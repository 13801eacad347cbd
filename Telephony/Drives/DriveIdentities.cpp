// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/DriveIdentities.h"

#include "Telephony/Drives/ScenarioRandom.h"

#include <cstddef>
#include <string_view>

namespace velmora {

namespace {

/// Ends the digits with their check digit (ISO/IEC 7812-1, annex B).
std::string withCheckDigit(std::string digits) {
    int sum = 0;
    for (std::size_t i = 0; i < digits.size(); ++i) {
        const int digit = digits[digits.size() - 1 - i] - '0';
        const int weighted = i % 2 == 0 ? 2 * digit : digit;
        sum += weighted / 10 + weighted % 10;
    }
    return digits + static_cast<char>('0' + (10 - sum % 10) % 10);
}

class IdentityMaker {
public:
    explicit IdentityMaker(std::uint64_t seed) : _random(seed ^ 0x1DE4717) {}

    /// `begin` and random digits, so many in all.
    [[nodiscard]] std::string digits(std::string_view begin, std::size_t count) {
        std::string text(begin);
        while (text.size() < count)
            text += static_cast<char>('0' + _random.between(0, 9));
        return text;
    }
    [[nodiscard]] DriveIdentities::SIM sim(const std::string& network) {
        return {withCheckDigit(digits("8949", 18)), digits(network, 15), number()};
    }
    [[nodiscard]] std::string number() {
        return "+49 " + digits("15", 3) + " " + digits("", 4) + " " + digits("", 4);
    }
    /// What IPv4 addresses begin with, in a network that is not for documents.
    [[nodiscard]] std::string addresses() {
        std::string text = "10.";
        for (int i = 0; i < 2; ++i)
            text += std::to_string(_random.between(100, 254)) + ".";
        return text;
    }
    [[nodiscard]] std::string addresses6() {
        constexpr std::string_view hexadecimal = "0123456789abcdef";
        std::string text = "2a00";
        for (int group = 0; group < 3; ++group) {
            text += ":" + std::string(1, hexadecimal[static_cast<std::size_t>(_random.between(1, 15))]);
            for (int i = 0; i < 3; ++i)
                text += hexadecimal[static_cast<std::size_t>(_random.between(0, 15))];
        }
        return text + "::";
    }

private:
    ScenarioRandom _random;
};

} // namespace

DriveIdentities DriveIdentities::random(std::uint64_t seed) {
    IdentityMaker maker(seed);
    DriveIdentities identities;
    identities.sims = {maker.sim("00101"), maker.sim("00102")};
    identities.mailbox = maker.number();
    identities.eid = maker.digits("89049032", 32);
    identities.equipment = withCheckDigit(maker.digits("35", 14));
    identities.addresses = maker.addresses();
    identities.addresses6 = maker.addresses6();
    identities.bearerAddresses = maker.addresses();
    identities.bearerAddresses6 = maker.addresses6();
    return identities;
}

std::vector<std::string> DriveIdentities::texts() const {
    std::vector<std::string> all;
    for (const SIM& sim : sims)
        all.insert(all.end(), {sim.iccid, sim.imsi, sim.number});
    all.insert(all.end(),
               {mailbox, eid, equipment, addresses, addresses6, bearerAddresses, bearerAddresses6});
    return all;
}

std::string withoutSpaces(std::string number) {
    std::erase(number, ' ');
    return number;
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/Pseudonyms/AddressPseudonyms.h"

#include "Export/Masking/Pseudonyms/Permutation.h"

#include <algorithm>
#include <vector>

#include <arpa/inet.h>

namespace velmora {

namespace {

using Version4 = AddressPseudonyms::Version4;
using Version6 = AddressPseudonyms::Version6;

constexpr std::array<std::array<std::uint8_t, 3>, 3> documentNetworks = {
    {{192, 0, 2}, {198, 51, 100}, {203, 0, 113}}};
constexpr std::array<std::uint8_t, 4> documentPrefix = {0x20, 0x01, 0x0D, 0xB8};
constexpr unsigned hostsOfNetwork = 254;
constexpr unsigned documentHosts = documentNetworks.size() * hostsOfNetwork;
// Of 198.18.0.0/15, in networks of 24 bits.
constexpr std::array<std::uint8_t, 2> benchmarkPrefix = {198, 18};
constexpr unsigned benchmarkNetworks = 512;

template <class Address>
bool isUnspecified(const Address& address) {
    return std::ranges::all_of(address, [](std::uint8_t byte) { return byte == 0; });
}

template <class Address>
std::optional<Address> read(std::string_view text, int family) {
    Address address;
    const std::string terminated(text);
    return ::inet_pton(family, terminated.c_str(), address.data()) == 1 ? std::optional(address)
                                                                        : std::nullopt;
}

template <class Address>
std::string write(const Address& address, int family) {
    char text[INET6_ADDRSTRLEN];
    return ::inet_ntop(family, address.data(), text, sizeof text);
}

template <class Address>
std::vector<std::uint8_t> messageOf(const Address& address) {
    std::vector<std::uint8_t> message{static_cast<std::uint8_t>(PseudonymKind::Address)};
    message.insert(message.end(), address.begin(), address.end());
    return message;
}

/// The address without a prefix length.
std::string_view bare(std::string_view address) {
    return address.substr(0, address.find('/'));
}

} // namespace

Version4 AddressPseudonyms::version4(const Version4& address) const {
    if (isUnspecified(address))
        return address;
    const KeyedHash::Digest digest = _hash(messageOf(address));
    std::uint32_t number = 0;
    for (std::size_t i = 0; i < sizeof number; ++i)
        number = number << 8 | digest[i];
    number %= documentHosts + benchmarkNetworks * hostsOfNetwork;
    const auto host = [](unsigned index) { return static_cast<std::uint8_t>(1 + index % hostsOfNetwork); };
    if (number < documentHosts) {
        const auto& network = documentNetworks[number / hostsOfNetwork];
        return {network[0], network[1], network[2], host(number)};
    }
    number -= documentHosts;
    const unsigned network = number / hostsOfNetwork;
    return {benchmarkPrefix[0], static_cast<std::uint8_t>(benchmarkPrefix[1] + network / 256),
            static_cast<std::uint8_t>(network % 256), host(number)};
}

Version6 AddressPseudonyms::version6(const Version6& address) const {
    if (isUnspecified(address))
        return address;
    const KeyedHash::Digest digest = _hash(messageOf(address));
    Version6 result{};
    std::copy(documentPrefix.begin(), documentPrefix.end(), result.begin());
    std::copy_n(digest.begin(), result.size() - documentPrefix.size(),
                result.begin() + documentPrefix.size());
    return result;
}

std::optional<std::string> AddressPseudonyms::text(std::string_view address) const {
    const std::string_view alone = bare(address);
    const std::string_view prefix = address.substr(alone.size());
    if (prefix.size() > 4 || prefix.find_first_not_of("/0123456789") != std::string_view::npos)
        return std::nullopt;
    if (const auto four = read<Version4>(alone, AF_INET))
        return write(version4(*four), AF_INET).append(prefix);
    if (const auto six = read<Version6>(alone, AF_INET6))
        return write(version6(*six), AF_INET6).append(prefix);
    return std::nullopt;
}

bool isDocumentationAddress(std::string_view address) {
    if (const auto four = read<Version4>(bare(address), AF_INET))
        return isUnspecified(*four) ||
               ((*four)[0] == benchmarkPrefix[0] && ((*four)[1] & ~1U) == benchmarkPrefix[1]) ||
               std::ranges::any_of(documentNetworks, [&](const auto& network) {
                   return std::equal(network.begin(), network.end(), four->begin());
               });
    const auto six = read<Version6>(bare(address), AF_INET6);
    return six &&
           (isUnspecified(*six) || std::equal(documentPrefix.begin(), documentPrefix.end(), six->begin()));
}

} // namespace velmora

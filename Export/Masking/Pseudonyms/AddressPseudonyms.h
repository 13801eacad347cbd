// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/Pseudonyms/KeyedHash.h"

#include <array>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// Pseudonyms of addresses: those that are reserved for documents, 192.0.2.0/24, 198.51.100.0/24 and
/// 203.0.113.0/24 (RFC 5737) and 2001:db8::/32 (RFC 3849), and, since the former are but 762, for benchmarks,
/// 198.18.0.0/15 (RFC 2544), which no public network routes (RFC 6890). Of version 4 there are 130,810 in
/// all, so that two addresses may have the same.
class AddressPseudonyms {
public:
    /// `hash` must outlive it.
    explicit AddressPseudonyms(const KeyedHash& hash) : _hash(hash) {}

    /// Of an address in text, with a prefix length perhaps; absent for what is none. The unspecified address
    /// stays.
    [[nodiscard]] std::optional<std::string> text(std::string_view address) const;

    using Version4 = std::array<std::uint8_t, 4>;
    using Version6 = std::array<std::uint8_t, 16>;
    [[nodiscard]] Version4 version4(const Version4& address) const;
    [[nodiscard]] Version6 version6(const Version6& address) const;

private:
    const KeyedHash& _hash;
};

/// Whether the text is an address that is reserved for documents or benchmarks, or the unspecified one.
[[nodiscard]] bool isDocumentationAddress(std::string_view address);

} // namespace velmora

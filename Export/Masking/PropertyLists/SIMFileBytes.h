// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/Pseudonyms/Pseudonyms.h"
#include "Platform/Bytes.h"

#include <cstdint>
#include <span>
#include <vector>

namespace velmora {

/// Pseudonyms of elementary files as the SIM has them, byte for byte as long. Files of another length than
/// the standard's, and of kinds that are not known here, have all bytes replaced but those that are 0xFF.
namespace simFileBytes {

/// EF-ICCID (ETSI TS 102 221 13.2): digits as swapped BCD.
[[nodiscard]] std::vector<std::uint8_t> iccid(Bytes file, Pseudonyms& pseudonyms);
/// EF-LOCI and EF-PSLOCI (3GPP TS 31.102 4.2.17, 4.2.23): the temporary identity and its signature where
/// identities are masked, the area where areas are.
[[nodiscard]] std::vector<std::uint8_t> location(Bytes file, const MaskOptions& options,
                                                 Pseudonyms& pseudonyms);
/// A list of networks of three bytes each (3GPP TS 24.008 10.5.1.3).
[[nodiscard]] std::vector<std::uint8_t> networks(Bytes file, Pseudonyms& pseudonyms);
[[nodiscard]] std::vector<std::uint8_t> other(Bytes file, Pseudonyms& pseudonyms);

} // namespace simFileBytes

/// Replaces the network in three bytes, in place (3GPP TS 24.008 10.5.1.3). What are no digits stays.
void maskNetwork(std::span<std::uint8_t> network, NumberPseudonyms& numbers);

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/MaskLevel.h"
#include "Export/Masking/Pseudonyms/KeyedHash.h"
#include "Platform/Bytes.h"

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// What a masked file says of itself: how it was masked, and digests of its messages and positions, which
/// show that they are still the ones that were written. Pseudonyms look like what they stand for, so nothing
/// else tells them from identities. A recording has it as comments of its section and of its last block, a
/// snapshot as its description, a DLF log in the unused rest of its version report.
struct MaskSeal {
    MaskLevel level = MaskLevel::Identity;
    std::string key;    ///< its fingerprint
    std::string digest; ///< empty where it is not known yet: at the beginning of a recording
    /// The digest of the sentences of positions; empty with the other, in files that cannot have any, and in
    /// seals of earlier versions, which do not cover them.
    std::string positions = {};

    [[nodiscard]] std::string text() const;
    /// Absent for any other text.
    [[nodiscard]] static std::optional<MaskSeal> read(std::string_view text);

    /// Where a DLF log's version report has it, and in how many bytes.
    static constexpr std::size_t reportOffset = 88;
    static constexpr std::size_t reportLength = 72;
    [[nodiscard]] std::vector<std::uint8_t> bytes() const;
    [[nodiscard]] static std::optional<MaskSeal> read(Bytes bytes);

    friend bool operator==(const MaskSeal&, const MaskSeal&) = default;
};

/// The digest of messages: SHA-256 over the technology, length and bytes of each.
class MessageDigest {
public:
    void add(std::string_view technology, Bytes message);
    /// A sentence of positions.
    void addSentence(std::string_view text);
    /// Of all so far, in hexadecimal; then it begins again.
    [[nodiscard]] std::string text();

private:
    Hash _hash;
};

} // namespace velmora

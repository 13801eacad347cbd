// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/Pseudonyms/Pseudonyms.h"
#include "Platform/Result.h"
#include "Recording/MessageReader.h"

#include <cstdint>
#include <limits>
#include <map>
#include <optional>
#include <string>

namespace velmora {

/// Some of a file's messages in a new recording, with notes as comments on them. The input is never changed,
/// and nothing is overwritten. What a recording holds beside messages, such as positions, is kept; of a
/// masked copy only the positions of receivers are, as `mask` keeps them.
struct MarkedCopy {
    std::string input;
    std::string output;
    std::string technology;  ///< the short name of the messages that count
    std::uint64_t first = 0; ///< positions among the technology's messages
    std::uint64_t last = std::numeric_limits<std::uint64_t>::max();
    std::map<std::uint64_t, std::string> notes; ///< by position; others than those written are left out

    /// Returns how many messages were written.
    [[nodiscard]] Result<std::uint64_t> write() const;
    std::optional<MaskOptions> masking = std::nullopt; ///< absent for messages as they are

private:
    [[nodiscard]] Result<std::uint64_t> writeTo(int descriptor) const;
    [[nodiscard]] Result<std::uint64_t> writeMasked(MessageReader& reader, int descriptor) const;
    template <class Add>
    [[nodiscard]] Result<std::uint64_t> copyMessages(MessageReader& reader, Add add) const;
};

} // namespace velmora

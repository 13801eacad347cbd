// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Terminal/KeyPress.h"

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// Reads keys from the bytes that a terminal sends for them. Sequences may arrive in parts; unknown ones and
/// bytes that are no UTF-8 are skipped.
class KeyReader {
public:
    [[nodiscard]] std::vector<KeyPress> take(std::string_view bytes);
    /// Whether the bytes so far may be the Escape key or the beginning of another one. If nothing follows
    /// within a moment, `finish` says what was pressed.
    [[nodiscard]] bool isWaiting() const { return !_pending.empty(); }
    [[nodiscard]] std::vector<KeyPress> finish();

private:
    /// How many bytes the first key has; 0 while they are incomplete.
    [[nodiscard]] std::size_t lengthOfFirst() const;
    [[nodiscard]] static std::optional<KeyPress> keyOf(std::string_view bytes);

    std::string _pending; ///< an incomplete sequence
};

} // namespace velmora

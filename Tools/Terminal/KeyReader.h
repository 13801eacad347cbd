// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// A key that means something to the screen.
enum class Key { Up, Down, PageUp, PageDown, Home, End, Quit };

/// Reads keys from the bytes that a terminal sends for them. Sequences may arrive in parts; unknown ones are
/// skipped.
class KeyReader {
public:
    [[nodiscard]] std::vector<Key> take(std::string_view bytes);

private:
    std::string _pending; ///< an incomplete sequence
};

} // namespace velmora

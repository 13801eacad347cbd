// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Messages/TimeRange.h"

#include <optional>
#include <string>

namespace velmora {

/// One side of a comparison: a file, or what it shows at a time.
struct DiffInput {
    /// Of "FILE", or of "FILE@TIME". A file that there is under the whole name is that file, whatever its
    /// name.
    [[nodiscard]] static DiffInput of(const std::string& text);

    /// As it was named in the call.
    [[nodiscard]] const std::string& text() const { return _text; }

    std::string file; ///< "-" is standard input
    std::optional<TimeBound> time;

private:
    std::string _text;
};

} // namespace velmora

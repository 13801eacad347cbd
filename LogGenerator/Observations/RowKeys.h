// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Observation.h"
#include "LogGenerator/Observations/TextArena.h"

#include <span>
#include <string_view>

namespace velmora {

/// Makes what identifies the rows of lists from message to message: "6300/17".
class RowKeys {
public:
    /// Sets the key of a row's observations, of which there is one at least, to the texts of the leaves of
    /// these names. It is kept in `texts`.
    void set(std::span<Observation> row, std::span<const std::string_view> names, TextArena& texts);

private:
    ObservedText _text;
};

} // namespace velmora

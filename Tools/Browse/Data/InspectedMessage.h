// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"
#include "Recording/MessageReader.h"
#include "Tools/Browse/Data/DisplayRows.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// Where in a message a field lies.
struct FieldPlace {
    std::size_t begin = 0;  ///< the first byte
    std::size_t end = 0;    ///< the first byte past it
    std::uint8_t bit = 0;   ///< the lowest bit, where it is no whole bytes
    std::uint8_t width = 0; ///< in bits

    [[nodiscard]] bool has(std::size_t offset) const { return offset >= begin && offset < end; }
};

/// A value that a message reported.
struct ReportedField {
    std::string path;                ///< in the display
    std::string text;                ///< printable
    std::optional<FieldPlace> place; ///< absent where the tables do not have it
};

/// All that is shown of a message.
struct InspectedMessage {
    std::uint64_t position = 0;
    LoggedMessage message;
    std::vector<ReportedField> fields;
    std::vector<DisplayRow> rows; ///< the display after it
};

} // namespace velmora

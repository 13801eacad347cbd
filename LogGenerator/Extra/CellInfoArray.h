// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

#include <cstdint>
#include <optional>
#include <string_view>

namespace velmora {

/// The cell information array: the cells that the phone sees, as the telephony service describes them.
class CellInfoArrayReader {
public:
    /// Logs "Cell Info Array data could not be constructed" when the payload cannot be read, and then holds
    /// none.
    explicit CellInfoArrayReader(const Data& record);
    /// What the payload holds, whatever its kind.
    [[nodiscard]] const Value& parsed() const { return _parsed; }
    /// The cells. Where there is no array - the payload is unreadable or of another kind - null, with the
    /// error line "Failed to get Cell Array".
    [[nodiscard]] const Array* cells() const;

private:
    Value _parsed;
};

/// Whether `cell` is a dictionary whose radio access technology and cell type are these two. One that
/// lacks either key is not.
[[nodiscard]] bool isCell(const Value& cell, std::string_view technology, std::string_view type);

/// A cell's number as a signed 32-bit integer. Absent where the key is missing or its value does not convert:
/// text, data and booleans are no numbers, and a number that has a fraction or does not fit 32 bits would
/// show as another one.
[[nodiscard]] std::optional<std::int32_t> cellNumber(const Dictionary& cell, std::string_view key);

} // namespace velmora

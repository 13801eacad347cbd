// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Extra/Cell.h"
#include "LogGenerator/Extra/XMLCellReader.h"
#include "Platform/Bytes.h"

#include <cstdint>
#include <vector>

namespace velmora {

/// The cell information array of the latest record, read once for all sections that use it. Shared by the
/// sections of a class index.
class CellList {
public:
    /// The cells of the record, in the list's order, without what is no cell; null where the payload holds no
    /// array or cannot be read, which then is logged as CellInfoArrayReader does. Valid until the next call.
    [[nodiscard]] const std::vector<Cell>* read(const Data& record);

    /// During its lifetime every call of `read` is for the same record, which need not be compared with the
    /// last one then.
    class SameRecordScope {
    public:
        explicit SameRecordScope(CellList& cells) : _cells(cells) { _cells._isSameRecord = true; }
        ~SameRecordScope() { _cells._isSameRecord = _cells._isRead = false; }
        SameRecordScope(const SameRecordScope&) = delete;
        SameRecordScope& operator=(const SameRecordScope&) = delete;

    private:
        CellList& _cells;
    };

private:
    [[nodiscard]] bool readPayload(const Data& record);
    [[nodiscard]] bool readAsPropertyList(const Data& record);

    std::vector<std::uint8_t> _payload; ///< that `_cells` were read from; empty before
    std::vector<Cell> _cells;
    XMLCellReader _xmlReader;
    bool _isSameRecord = false;
    bool _isRead = false; ///< the same record has been
};

/// The first cell of that kind, or null.
[[nodiscard]] const Cell* firstCell(const std::vector<Cell>& cells, const CellKind& kind);

} // namespace velmora

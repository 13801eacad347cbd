// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/CellRows.h"

namespace velmora {

void CellRows::report(const MessageReport& report, const RadioPicture& picture,
                      std::chrono::nanoseconds passed) {
    if (Row* const row = current())
        row->time += passed;
    const std::uint32_t before = _number;
    _number = _cells.numberOf(picture);
    if (_number != ServingCells::unknown && _number != ServingCells::further && _number > _rows.size())
        _rows.resize(_number);
    Row* const row = current();
    if (!row)
        return;
    if (row->visits == 0) {
        row->first = report.time;
        row->firstMessage = report.message;
    }
    if (_number != before)
        ++row->visits;
    row->last = report.time;
    row->lastMessage = report.message;
}

} // namespace velmora

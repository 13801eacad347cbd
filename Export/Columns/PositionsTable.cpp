// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/PositionsTable.h"

#include "Export/Columns/DecimalDegrees.h"

namespace velmora::positionsTable {

namespace {

struct Column {
    static constexpr std::size_t time = 1;
    static constexpr std::size_t latitude = 2;
    static constexpr std::size_t longitude = 3;
    static constexpr std::size_t altitude = 4;
    static constexpr std::size_t speed = 5;
    static constexpr std::size_t course = 6;
    static constexpr std::size_t hdop = 7;
    static constexpr std::size_t deviation = 8;
};

constexpr int decimals = 2;

} // namespace

TableLayout layout(std::string_view technology) {
    TableLayout layout = inputTable("positions", technology);
    layout.columns.push_back({{"time", StoredType::Integer, ValueMeaning::Timestamp, false}, true});
    static_cast<void>(addPlace(layout));
    for (const char* const name : {"altitude_m", "speed_m_s", "course_degree", "hdop", "deviation_m"})
        layout.add(name, StoredType::Number);
    return layout;
}

void add(InputTable& table, const Fix& fix) {
    const DecimalDegrees place = decimalDegreesOf(fix);
    table.addRow();
    table.setInteger(Column::time, fix.time.time_since_epoch().count());
    table.setInteger(Column::latitude, place.latitude);
    table.setInteger(Column::longitude, place.longitude);
    table.setNumber(Column::altitude, fix.altitude_m, decimals);
    table.setNumber(Column::speed, fix.speed_mps, decimals);
    table.setNumber(Column::course, fix.course_degrees, decimals);
    table.setNumber(Column::hdop, fix.hdop, decimals);
    table.setNumber(Column::deviation, fix.deviation_m, decimals);
}

} // namespace velmora::positionsTable

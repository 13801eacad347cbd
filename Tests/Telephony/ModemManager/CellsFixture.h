// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/TelephonyService.h"
#include "Tests/Telephony/ModemManager/ModemManagerFixture.h"

#include <initializer_list>
#include <memory>
#include <string_view>

namespace velmora {

class CellsFixture : public ModemManagerTest {
protected:
    void setCells(const CellList& cells) {
        mock.answers["GetCellInfo"] = {{QVariant::fromValue(cells)}, {}, {}};
    }
    void putModem(uint access) { mock.put(Mock::modemPath(0), testModem(access)); }

    /// The first cell list that comes.
    Value cells() {
        EXPECT_TRUE(comes([this] { return count(cellCode) > 0; }));
        return latest(cellCode);
    }
};

/// A cell dictionary of the array.
inline Value cell(std::string_view technology, std::string_view type,
                  std::initializer_list<Dictionary::Entry> members) {
    const auto dictionary = std::make_shared<Dictionary>(members);
    dictionary->set(kVoxCellMonitorCellRadioAccessTechnology, technology);
    dictionary->set(kVoxCellMonitorCellType, type);
    return dictionary;
}

inline Value array(std::initializer_list<Value> values) {
    return std::make_shared<Array>(values);
}

} // namespace velmora

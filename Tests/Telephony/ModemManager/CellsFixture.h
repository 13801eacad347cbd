// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/TelephonyService.h"
#include "Tests/Telephony/ModemManager/ModemManagerFixture.h"

#include <initializer_list>
#include <memory>
#include <string>
#include <string_view>

namespace velmora {

class CellsFixture : public ModemManagerTest {
protected:
    using ModemManagerTest::ModemManagerTest;

    void setCells(const CellList& cells) {
        mock.answers["GetCellInfo"] = {{QVariant::fromValue(cells)}, {}, {}};
    }
    void refuse(const QString& member, const QString& error, const QString& text = {}) {
        mock.answers[member] = {{}, error, text};
    }
    void setPlace(const QString& place) {
        mock.answers["GetLocation"] = {{QVariant::fromValue(LocationMap{{1U, QDBusVariant(place)}})}, {}, {}};
    }
    void putModem(uint access, const QVariantMap& signal = {}) {
        InterfaceMap modem = testModem(access);
        if (!signal.isEmpty())
            modem[Mock::signal] = signal;
        mock.put(Mock::modemPath(0), modem);
    }

    /// The cells of the first message after a measurement.
    Value cells() {
        const Value notYet(static_cast<std::int64_t>(ModemCellReport::NotYet));
        EXPECT_TRUE(passes([&] {
            const Value report = latest(LiveModemCode::cells, {"kVoxModemCellReport"});
            return !report.isNone() && !(report == notYet);
        }));
        return latest(LiveModemCode::cells, {"kVoxCellMonitorCells"});
    }
    [[nodiscard]] Value inCells(const std::string& key) const { return latest(LiveModemCode::cells, {key}); }
};

/// A cell of a message.
inline Value cell(std::string_view technology, std::string_view type,
                  std::initializer_list<Dictionary::Entry> members) {
    const auto dictionary = std::make_shared<Dictionary>(members);
    dictionary->set(kVoxCellMonitorCellRadioAccessTechnology, technology);
    dictionary->set(kVoxCellMonitorCellType, type);
    return dictionary;
}
inline Value serving(std::string_view technology, std::initializer_list<Dictionary::Entry> members) {
    return cell(technology, kVoxCellMonitorCellTypeServing, members);
}
inline Value neighbor(std::string_view technology, std::initializer_list<Dictionary::Entry> members) {
    return cell(technology, kVoxCellMonitorCellTypeNeighbor, members);
}

inline constexpr std::string_view unsupported = "org.freedesktop.ModemManager1.Error.Core.Unsupported";
/// A member that a modem sets for what it does not know.
inline constexpr uint unknownNumber = 0x7FFFFFFF;

inline Value number(ModemCellReport report) {
    return static_cast<std::int64_t>(report);
}
inline Value number(ModemPresence presence) {
    return static_cast<std::int64_t>(presence);
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tests/Telephony/ModemManager/ModemManagerFixture.h"

#include <cstdint>
#include <initializer_list>
#include <memory>

namespace velmora {

inline Value dictionary(std::initializer_list<Dictionary::Entry> entries) {
    return std::make_shared<Dictionary>(entries);
}

class SIMAndBearersFixture : public ModemManagerTest {
protected:
    void putModem(const QVariantMap& properties) {
        mock.put(Mock::modemPath(0), testModem(lteAccess, properties));
    }
    static QVariant paths(const QStringList& texts) {
        QList<QDBusObjectPath> list;
        for (const QString& text : texts)
            list.push_back(QDBusObjectPath(text));
        return QVariant::fromValue(list);
    }
    [[nodiscard]] bool receives(std::uint16_t code, const Value& list) {
        return passes([&] { return latest(code) == list; });
    }
};

} // namespace velmora

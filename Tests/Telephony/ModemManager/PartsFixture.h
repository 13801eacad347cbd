// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tests/Telephony/ModemManager/CellsFixture.h"

namespace velmora {

/// What belongs to a modem beside its cells.
class PartsFixture : public CellsFixture {
protected:
    void putModemWith(const QVariantMap& properties) {
        mock.put(Mock::modemPath(0), testModem(lteAccess, properties));
    }
    static QVariant paths(const QStringList& texts) {
        QList<QDBusObjectPath> list;
        for (const QString& text : texts)
            list.push_back(QDBusObjectPath(text));
        return QVariant::fromValue(list);
    }
    /// The root of a message about `testModem` with these keys.
    static Value root(std::initializer_list<Dictionary::Entry> entries) {
        const Value whole = dictionary({{"kVoxModemPresence", 0}, {"kVoxModemState", 8}});
        for (const Dictionary::Entry& each : entries)
            whole.asDictionary()->set(each.key, each.value);
        return whole;
    }
};

} // namespace velmora

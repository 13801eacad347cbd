// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QDBusConnection>
#include <QDBusMessage>
#include <QDBusObjectPath>
#include <QDBusVariant>
#include <QDBusVirtualObject>
#include <QMap>
#include <QString>
#include <QStringList>
#include <QVariant>

#include <cstddef>
#include <map>
#include <string>
#include <vector>

namespace velmora {

/// Types of ModemManager's interface that Qt has no names for, as they lie on the bus.
using InterfaceMap = QMap<QString, QVariantMap>;       // a{sa{sv}}
using ObjectMap = QMap<QDBusObjectPath, InterfaceMap>; // a{oa{sa{sv}}}
using CellList = QList<QVariantMap>;                   // aa{sv}
using LocationMap = QMap<uint, QDBusVariant>;          // a{uv}
struct Quality {                                       // (ub)
    uint percent = 0;
    bool recent = true;
};
struct PreferredNetwork { // (su)
    QString network;
    uint technologies = 0;
};
using PreferredNetworks = QList<PreferredNetwork>; // a(su)
struct BearerError {                               // (ss)
    QString name;
    QString text;
};

/// ModemManager as a test makes it up, in the test's own process: it has the objects, and returns the
/// replies, that the test says, and keeps the calls that arrive. It behaves as ModemManager 1.20 does on the
/// bus: modems are listed by the object manager, SIMs and bearers are not.
class MockModemManager final : public QDBusVirtualObject {
public:
    /// A method's answer: values, or an error.
    struct Answer {
        QVariantList values;
        QString error; ///< its name on the bus; empty for none
        QString text;
    };
    struct Call {
        QString path;
        QString member;
        QVariantList arguments;
    };

    inline static const QString modem = QStringLiteral("org.freedesktop.ModemManager1.Modem");
    inline static const QString modem3gpp = QStringLiteral("org.freedesktop.ModemManager1.Modem.Modem3gpp");
    inline static const QString modemCdma = QStringLiteral("org.freedesktop.ModemManager1.Modem.ModemCdma");
    inline static const QString location = QStringLiteral("org.freedesktop.ModemManager1.Modem.Location");
    inline static const QString signal = QStringLiteral("org.freedesktop.ModemManager1.Modem.Signal");
    inline static const QString sim = QStringLiteral("org.freedesktop.ModemManager1.Sim");
    inline static const QString bearer = QStringLiteral("org.freedesktop.ModemManager1.Bearer");
    /// ModemManager itself.
    inline static const QString manager = QStringLiteral("org.freedesktop.ModemManager1");
    inline static const QString managerPath = QStringLiteral("/org/freedesktop/ModemManager1");

    [[nodiscard]] static QString modemPath(int index);
    [[nodiscard]] static QString simPath(int index);
    [[nodiscard]] static QString bearerPath(int index);

    /// Connects to the bus and takes ModemManager's name.
    explicit MockModemManager(const std::string& address);
    ~MockModemManager() override;

    /// Leaves the bus's name, and takes it again: a ModemManager that ends and starts.
    void vanish();
    void appear();

    /// Objects that exist before the first client are not signalled; later ones are signalled as added.
    void put(const QString& path, const InterfaceMap& interfaces);
    void remove(const QString& path);
    void removeInterface(const QString& path, const QString& interface);
    /// Changes properties and signals that.
    void change(const QString& path, const QString& interface, const QVariantMap& changed);
    /// A property's value is invalidated.
    void invalidate(const QString& path, const QString& interface, const QStringList& names);
    void emitSignal(const QString& path, const QString& interface, const QString& member,
                    const QVariantList& arguments);

    /// Answers of methods by name; one without an entry is answered as unknown.
    std::map<QString, Answer> answers;
    /// Calls of methods with that name, and calls of that object, are kept unanswered until `release`.
    QString held;
    QString heldPath;
    void release();
    /// Setup of the levels sets their rate, and signals that.
    bool setsRates = false;

    std::vector<Call> calls;
    [[nodiscard]] std::size_t count(const QString& member) const;

    bool handleMessage(const QDBusMessage& message, const QDBusConnection& connection) override;
    [[nodiscard]] QString introspect(const QString&) const override { return {}; }

private:
    [[nodiscard]] Answer answer(const QDBusMessage& message) const;
    void reply(const QDBusMessage& message);

    QDBusConnection _bus;
    std::map<QString, InterfaceMap> _objects; ///< by path
    std::vector<QDBusMessage> _waiting;
};

/// A modem of network 001-01 with a SIM, in that state and on that access technology.
[[nodiscard]] InterfaceMap testModem(uint accessTechnologies);
/// The same with these properties of its main interface changed.
[[nodiscard]] InterfaceMap testModem(uint accessTechnologies, const QVariantMap& properties);

/// Bits of the access technology.
inline constexpr uint gsmAccess = 1U << 3 | 1U << 1; // GPRS, GSM
inline constexpr uint umtsAccess = 1U << 5;
inline constexpr uint lteAccess = 1U << 14;
inline constexpr uint nrAccess = 1U << 15;

} // namespace velmora

Q_DECLARE_METATYPE(velmora::Quality)
Q_DECLARE_METATYPE(velmora::PreferredNetwork)
Q_DECLARE_METATYPE(velmora::BearerError)

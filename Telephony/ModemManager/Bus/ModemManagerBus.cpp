// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/Bus/ModemManagerBus.h"

#include "Telephony/ModemManager/Bus/BusValue.h"
#include "Telephony/ModemManager/Bus/ModemManagerNames.h"

#include <QDBusConnection>
#include <QDBusError>
#include <QDBusMessage>
#include <QDBusPendingCall>
#include <QDBusPendingCallWatcher>
#include <QDBusServiceWatcher>
#include <QObject>

#include <utility>

namespace velmora {
namespace {

QString textOf(std::string_view text) {
    return QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size()));
}

QDBusMessage messageOf(const BusCall& call) {
    auto message = QDBusMessage::createMethodCall(textOf(mm::service), QString::fromStdString(call.path),
                                                  textOf(call.interface), textOf(call.method));
    message.setArguments(call.arguments);
    message.setAutoStartService(call.startsService);
    return message;
}

BusReply replyOf(const QDBusMessage& message) {
    BusReply reply;
    reply.sender = message.service().toStdString();
    if (message.type() == QDBusMessage::ErrorMessage) {
        reply.error = printableForLog(message.errorName().toStdString());
        reply.text = printableForLog(message.errorMessage().toStdString());
        if (reply.error.empty())
            reply.error = "an error without a name";
    } else if (!message.arguments().isEmpty()) {
        reply.value = busValue(message.arguments().constFirst());
    }
    return reply;
}

} // namespace

bool BusReply::isUnsupported() const {
    return error == "org.freedesktop.ModemManager1.Error.Core.Unsupported" ||
           error == "org.freedesktop.DBus.Error.NotSupported" ||
           error == "org.freedesktop.DBus.Error.UnknownMethod" ||
           error == "org.freedesktop.DBus.Error.UnknownInterface";
}

bool BusReply::isDenied() const {
    return error == "org.freedesktop.DBus.Error.AccessDenied" ||
           error == "org.freedesktop.DBus.Error.AuthFailed" ||
           error == "org.freedesktop.ModemManager1.Error.Core.Unauthorized";
}

bool BusReply::isAbsent() const {
    return error == "org.freedesktop.DBus.Error.ServiceUnknown" ||
           error == "org.freedesktop.DBus.Error.NameHasNoOwner" ||
           error.starts_with("org.freedesktop.DBus.Error.Spawn.") ||
           error.starts_with("org.freedesktop.systemd1.");
}

std::string BusReply::reason() const {
    return text.empty() ? error : error + ": " + text;
}

/// Qt's side of it: the signals end in slots of this object, and the answers on their way are its children.
class ModemManagerBus::Connection final : public QObject {
    Q_OBJECT

public:
    Connection(QDBusConnection bus, Observer& observer)
        : _bus(std::move(bus)), _observer(observer),
          _owner(textOf(mm::service), _bus, QDBusServiceWatcher::WatchForOwnerChange) {
        const QString service = textOf(mm::service);
        const QString manager = textOf(mm::objectManager);
        const char* arrived = SLOT(signalArrived(QDBusMessage));
        _bus.connect(service, textOf(mm::rootPath), manager, QStringLiteral("InterfacesAdded"), this,
                     arrived);
        _bus.connect(service, textOf(mm::rootPath), manager, QStringLiteral("InterfacesRemoved"), this,
                     arrived);
        _bus.connect(service, QString(), textOf(mm::properties), QStringLiteral("PropertiesChanged"), this,
                     arrived);
        // What the library itself sends when the connection ends.
        _bus.connect(QString(), localPath, localInterface, localMember, this, SLOT(disconnected()));
        QObject::connect(&_owner, &QDBusServiceWatcher::serviceOwnerChanged, this,
                         [this](const QString&, const QString& before, const QString& now) {
                             dropCalls();
                             if (!before.isEmpty())
                                 _observer.serviceVanished();
                             if (!now.isEmpty())
                                 _observer.serviceAppeared();
                         });
    }

    ~Connection() override {
        // The library's own thread does the sending. Taking a signal back waits for that thread, and so for
        // all that was sent before: a program that ends next would cut it off.
        _bus.disconnect(QString(), localPath, localInterface, localMember, this, SLOT(disconnected()));
        const QString name = _bus.name();
        _bus = QDBusConnection(QString());
        QDBusConnection::disconnectFromBus(name);
    }

    void call(const BusCall& call, Answered answered) {
        auto* watcher = new QDBusPendingCallWatcher(
            _bus.asyncCall(messageOf(call), static_cast<int>(call.timeout.count())), this);
        QObject::connect(watcher, &QDBusPendingCallWatcher::finished, this,
                         [done = std::move(answered)](QDBusPendingCallWatcher* finished) {
                             finished->deleteLater();
                             done(replyOf(finished->reply()));
                         });
    }

    void send(const BusCall& call) { _bus.send(messageOf(call)); }

private slots:
    void signalArrived(const QDBusMessage& message) {
        Array arguments;
        for (const QVariant& each : message.arguments())
            arguments.append(busValue(each));
        _observer.signalArrived(message.path().toStdString(), message.member().toStdString(), arguments);
    }

    void disconnected() { _observer.busLost(); }

private:
    void dropCalls() {
        for (QDBusPendingCallWatcher* each : findChildren<QDBusPendingCallWatcher*>()) {
            each->disconnect();
            each->deleteLater();
        }
    }

    const QString localPath = QStringLiteral("/org/freedesktop/DBus/Local");
    const QString localInterface = QStringLiteral("org.freedesktop.DBus.Local");
    const QString localMember = QStringLiteral("Disconnected");

    QDBusConnection _bus;
    Observer& _observer;
    QDBusServiceWatcher _owner;
};

ModemManagerBus::ModemManagerBus(std::string address, Observer& observer)
    : _address(std::move(address)), _observer(observer) {}

ModemManagerBus::~ModemManagerBus() {
    close();
}

Result<Done> ModemManagerBus::open() {
    // A connection of its own, under a name that no other has.
    const QString name = QStringLiteral("velmora-modemmanager-%1").arg(reinterpret_cast<quintptr>(this));
    auto bus = _address.empty() ? QDBusConnection::connectToBus(QDBusConnection::SystemBus, name)
                                : QDBusConnection::connectToBus(QString::fromStdString(_address), name);
    if (!bus.isConnected()) {
        const std::string reason = printableForLog(bus.lastError().message().toStdString());
        bus = QDBusConnection(QString());
        QDBusConnection::disconnectFromBus(name);
        return Failure{reason};
    }
    _connection = std::make_unique<Connection>(std::move(bus), _observer);
    return Done{};
}

void ModemManagerBus::close() {
    _connection.reset();
}

void ModemManagerBus::call(const BusCall& call, Answered answered) {
    if (_connection)
        _connection->call(call, std::move(answered));
}

void ModemManagerBus::send(const BusCall& call) {
    if (_connection)
        _connection->send(call);
}

} // namespace velmora

#include "ModemManagerBus.moc"

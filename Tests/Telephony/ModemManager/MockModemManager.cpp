// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/MockModemManager.h"

#include <QDBusArgument>
#include <QDBusMetaType>

#include <algorithm>
#include <stdexcept>
#include <utility>

namespace velmora {

QDBusArgument& operator<<(QDBusArgument& argument, const Quality& quality) {
    argument.beginStructure();
    argument << quality.percent << quality.recent;
    argument.endStructure();
    return argument;
}

const QDBusArgument& operator>>(const QDBusArgument& argument, Quality& quality) {
    argument.beginStructure();
    argument >> quality.percent >> quality.recent;
    argument.endStructure();
    return argument;
}

QDBusArgument& operator<<(QDBusArgument& argument, const PreferredNetwork& network) {
    argument.beginStructure();
    argument << network.network << network.technologies;
    argument.endStructure();
    return argument;
}

const QDBusArgument& operator>>(const QDBusArgument& argument, PreferredNetwork& network) {
    argument.beginStructure();
    argument >> network.network >> network.technologies;
    argument.endStructure();
    return argument;
}

QDBusArgument& operator<<(QDBusArgument& argument, const BearerError& error) {
    argument.beginStructure();
    argument << error.name << error.text;
    argument.endStructure();
    return argument;
}

const QDBusArgument& operator>>(const QDBusArgument& argument, BearerError& error) {
    argument.beginStructure();
    argument >> error.name >> error.text;
    argument.endStructure();
    return argument;
}

namespace {

const QString serviceName = QStringLiteral("org.freedesktop.ModemManager1");
const QString rootPath = QStringLiteral("/org/freedesktop/ModemManager1");
const QString connectionName = QStringLiteral("velmora-test-modemmanager");

void registerTypes() {
    qDBusRegisterMetaType<InterfaceMap>();
    qDBusRegisterMetaType<ObjectMap>();
    qDBusRegisterMetaType<CellList>();
    qDBusRegisterMetaType<LocationMap>();
    qDBusRegisterMetaType<Quality>();
    qDBusRegisterMetaType<PreferredNetwork>();
    qDBusRegisterMetaType<PreferredNetworks>();
    qDBusRegisterMetaType<BearerError>();
    qDBusRegisterMetaType<QList<QDBusObjectPath>>();
}

bool isModem(const QString& path) {
    return path.startsWith(rootPath + QStringLiteral("/Modem/"));
}

QDBusConnection connected(const std::string& address) {
    registerTypes();
    auto bus = QDBusConnection::connectToBus(QString::fromStdString(address), connectionName);
    if (!bus.isConnected())
        throw std::runtime_error("the mock finds no bus");
    return bus;
}

} // namespace

QString MockModemManager::modemPath(int index) {
    return rootPath + QStringLiteral("/Modem/%1").arg(index);
}

QString MockModemManager::simPath(int index) {
    return rootPath + QStringLiteral("/SIM/%1").arg(index);
}

QString MockModemManager::bearerPath(int index) {
    return rootPath + QStringLiteral("/Bearer/%1").arg(index);
}

MockModemManager::MockModemManager(const std::string& address) : _bus(connected(address)) {
    if (!_bus.registerVirtualObject(rootPath, this, QDBusConnection::SubPath))
        throw std::runtime_error("the mock has no object");
    appear();
}

MockModemManager::~MockModemManager() {
    _bus.unregisterObject(rootPath, QDBusConnection::UnregisterTree);
    _bus = QDBusConnection(QString());
    QDBusConnection::disconnectFromBus(connectionName);
}

void MockModemManager::vanish() {
    _bus.unregisterService(serviceName);
    _objects.clear();
}

void MockModemManager::appear() {
    if (!_bus.registerService(serviceName))
        throw std::runtime_error("the mock has no name");
}

void MockModemManager::put(const QString& path, const InterfaceMap& interfaces) {
    _objects[path].insert(interfaces);
    if (isModem(path))
        emitSignal(rootPath, QStringLiteral("org.freedesktop.DBus.ObjectManager"),
                   QStringLiteral("InterfacesAdded"),
                   {QVariant::fromValue(QDBusObjectPath(path)), QVariant::fromValue(interfaces)});
}

void MockModemManager::remove(const QString& path) {
    const QStringList names = _objects[path].keys();
    _objects.erase(path);
    emitSignal(rootPath, QStringLiteral("org.freedesktop.DBus.ObjectManager"),
               QStringLiteral("InterfacesRemoved"), {QVariant::fromValue(QDBusObjectPath(path)), names});
}

void MockModemManager::removeInterface(const QString& path, const QString& interface) {
    _objects[path].remove(interface);
    emitSignal(rootPath, QStringLiteral("org.freedesktop.DBus.ObjectManager"),
               QStringLiteral("InterfacesRemoved"),
               {QVariant::fromValue(QDBusObjectPath(path)), QStringList(interface)});
}

void MockModemManager::change(const QString& path, const QString& interface, const QVariantMap& changed) {
    _objects[path][interface].insert(changed);
    emitSignal(path, QStringLiteral("org.freedesktop.DBus.Properties"), QStringLiteral("PropertiesChanged"),
               {interface, changed, QStringList()});
}

void MockModemManager::invalidate(const QString& path, const QString& interface, const QStringList& names) {
    for (const QString& name : names)
        _objects[path][interface].remove(name);
    emitSignal(path, QStringLiteral("org.freedesktop.DBus.Properties"), QStringLiteral("PropertiesChanged"),
               {interface, QVariantMap(), names});
}

void MockModemManager::emitSignal(const QString& path, const QString& interface, const QString& member,
                                  const QVariantList& arguments) {
    auto signalled = QDBusMessage::createSignal(path, interface, member);
    signalled.setArguments(arguments);
    if (!_bus.send(signalled))
        throw std::runtime_error("the mock cannot signal");
}

std::size_t MockModemManager::count(const QString& member) const {
    return static_cast<std::size_t>(std::count_if(
        calls.begin(), calls.end(), [&member](const Call& call) { return call.member == member; }));
}

bool MockModemManager::handleMessage(const QDBusMessage& message, const QDBusConnection&) {
    calls.push_back({message.path(), message.member(), message.arguments()});
    if (message.member() == held || message.path() == heldPath)
        _waiting.push_back(message);
    else
        reply(message);
    return true;
}

void MockModemManager::release() {
    held.clear();
    heldPath.clear();
    for (const QDBusMessage& message : std::exchange(_waiting, {}))
        reply(message);
}

void MockModemManager::reply(const QDBusMessage& message) {
    const Answer given = answer(message);
    _bus.send(given.error.isEmpty() ? message.createReply(given.values)
                                    : message.createErrorReply(given.error, given.text));
    if (setsRates && given.error.isEmpty() && message.member() == QStringLiteral("Setup"))
        change(message.path(), signal, {{"Rate", message.arguments().value(0)}});
}

MockModemManager::Answer MockModemManager::answer(const QDBusMessage& message) const {
    if (const auto given = answers.find(message.member()); given != answers.end())
        return given->second;
    if (message.member() == QStringLiteral("GetManagedObjects")) {
        ObjectMap modems;
        for (const auto& [path, interfaces] : _objects)
            if (isModem(path))
                modems.insert(QDBusObjectPath(path), interfaces);
        return {{QVariant::fromValue(modems)}, {}, {}};
    }
    const auto object = _objects.find(message.path());
    if (message.member() == QStringLiteral("GetAll") && object != _objects.end())
        return {{object->second.value(message.arguments().value(0).toString())}, {}, {}};
    return {
        {}, QStringLiteral("org.freedesktop.DBus.Error.UnknownMethod"), QStringLiteral("not of the mock")};
}

InterfaceMap testModem(uint accessTechnologies) {
    using Mock = MockModemManager;
    return {
        {Mock::modem,
         {
             {"Manufacturer", "Test"},
             {"Model", "Modem"},
             {"State", 8},
             {"AccessTechnologies", accessTechnologies},
             {"CurrentCapabilities", 1U << 2 | 1U << 3}, // GSM and UMTS, LTE
             {"SignalQuality", QVariant::fromValue(Quality{60, true})},
             {"OwnNumbers", QStringList("+15550100")},
             {"Sim", QVariant::fromValue(QDBusObjectPath(Mock::simPath(0)))},
             {"Bearers", QVariant::fromValue(QList<QDBusObjectPath>())},
         }},
        {Mock::modem3gpp,
         {
             {"RegistrationState", 1U},
             {"OperatorCode", "00101"},
             {"OperatorName", "Test Network"},
             {"InitialEpsBearer", QVariant::fromValue(QDBusObjectPath("/"))},
         }},
    };
}

InterfaceMap testModem(uint accessTechnologies, const QVariantMap& properties) {
    InterfaceMap modem = testModem(accessTechnologies);
    modem[MockModemManager::modem].insert(properties);
    return modem;
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Files/LinuxPreferences.h"

#include "Platform/Linux/Files/EnvironmentPath.h"
#include "Platform/Linux/Files/Files.h"
#include "Platform/SystemLog.h"
#include "PropertyLists/PropertyList.h"

#include <QDBusConnection>
#include <QDBusMessage>

#include <algorithm>
#include <system_error>
#include <utility>

namespace velmora {

namespace {

constexpr std::size_t maximumListSize = std::size_t{16} << 20;

/// A domain is a file's name, and so may not lead elsewhere.
bool isDomain(std::string_view domain) {
    return !domain.empty() && domain.front() != '.' &&
           domain.find_first_of(std::string_view("/\0", 2)) == domain.npos;
}

bool isBinary(Bytes list) {
    constexpr std::string_view mark = "bplist";
    return list.size() >= mark.size() && std::equal(mark.begin(), mark.end(), list.begin());
}

/// A domain's values and their form.
struct Earlier {
    Value values;
    bool isBinary = false;
};

/// No values where there is no file.
Result<Earlier> readValues(const std::filesystem::path& path) {
    std::error_code error;
    if (!std::filesystem::exists(path, error))
        return Earlier{makeDictionary()};
    const auto content = readFile(path, maximumListSize);
    if (!content)
        return Failure{content.reason()};
    auto list = readPropertyList(content->bytes());
    if (!list)
        return Failure{list.reason()};
    if (!list->asDictionary())
        return Failure{"holds " + std::string(nameOf(list->kind())) + ", wanted dictionary"};
    return Earlier{*std::move(list), isBinary(content->bytes())};
}

/// The list in the form that it had.
Result<std::vector<std::uint8_t>> serialize(const DictionaryRef& values, bool binary) {
    if (binary)
        return writeBinaryPropertyList(values);
    const auto text = writeXMLPropertyList(values);
    if (!text)
        return Failure{text.reason()};
    return std::vector<std::uint8_t>(text->begin(), text->end());
}

QString textOf(std::string_view text) {
    return QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size()));
}

} // namespace

LinuxPreferences::LinuxPreferences(std::filesystem::path directory, std::string busAddress)
    : _directory(directory.empty() ? userDirectory("XDG_CONFIG_HOME", ".config") : std::move(directory)),
      _busAddress(std::move(busAddress)) {}

std::filesystem::path LinuxPreferences::pathOf(std::string_view domain) const {
    return _directory / (std::string(domain) + ".plist");
}

bool LinuxPreferences::boolean(std::string_view domain, std::string_view key) const {
    const auto changes = _changes.find(domain);
    if (changes != _changes.end() && changes->second.contains(key))
        return changes->second[key] == Value(true);
    if (!isDomain(domain))
        return false;
    const std::filesystem::path path = pathOf(domain);
    const auto earlier = readValues(path);
    if (!earlier)
        logFormat(LogPriority::Error, "Preferences: %s: %s", path.c_str(), earlier.reason().c_str());
    return earlier && (*earlier->values.asDictionary())[key] == Value(true);
}

void LinuxPreferences::setBoolean(std::string_view domain, std::string_view key, bool value) {
    if (!isDomain(domain)) {
        logFormat(LogPriority::Error, "Preferences: \"%.*s\" is no domain's name",
                  static_cast<int>(domain.size()), domain.data());
        return;
    }
    _changes[std::string(domain)].set(key, value);
}

void LinuxPreferences::synchronize(std::string_view domain) {
    const auto changes = _changes.find(domain);
    if (changes == _changes.end())
        return;
    std::filesystem::path path = pathOf(domain);
    // The file that a link leads to is the one that is replaced.
    std::error_code error;
    if (const auto target = std::filesystem::canonical(path, error); !error)
        path = target;
    if (const auto written = write(path, changes->second); !written) {
        // What was set is kept for the next time.
        logFormat(LogPriority::Error, "Preferences: %s: %s", path.c_str(), written.reason().c_str());
        return;
    }
    _changes.erase(changes);
}

Result<Done> LinuxPreferences::write(const std::filesystem::path& path, const Dictionary& changes) const {
    const auto earlier = readValues(path);
    if (!earlier)
        return Failure{earlier.reason()};
    const auto values = makeDictionary();
    for (const auto& [key, value] : *earlier->values.asDictionary())
        values->set(key, value);
    for (const auto& [key, value] : changes)
        values->set(key, value);
    const auto bytes = serialize(values, earlier->isBinary);
    if (!bytes)
        return Failure{bytes.reason()};
    std::error_code error;
    std::filesystem::create_directories(path.parent_path(), error);
    return replaceFile(path, *bytes);
}

void LinuxPreferences::announceChange(std::string_view domain, std::string_view key) {
    // A connection of its own, so that it ends with the announcement.
    const QString name = QStringLiteral("velmora-preferences");
    {
        auto bus = _busAddress.empty()
                       ? QDBusConnection::connectToBus(QDBusConnection::SessionBus, name)
                       : QDBusConnection::connectToBus(QString::fromStdString(_busAddress), name);
        auto signal = QDBusMessage::createSignal(QStringLiteral("/com/velmora/Preferences"),
                                                 QStringLiteral("com.velmora.Preferences"),
                                                 QStringLiteral("PreferencesChanged"));
        signal << textOf(domain) << textOf(key);
        // Without a bus there is no one to notify.
        if (!bus.isConnected())
            logLine(LogPriority::Info, "Preferences: no session bus to announce the change on");
        else if (!bus.send(signal))
            logFormat(LogPriority::Error, "Preferences: the change of %.*s was not announced",
                      static_cast<int>(domain.size()), domain.data());
    }
    QDBusConnection::disconnectFromBus(name);
}

} // namespace velmora

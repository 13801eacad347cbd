// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Files/LinuxPreferences.h"
#include "Platform/Linux/Files/Files.h"
#include "PropertyLists/PropertyList.h"
#include "Tests/Platform/LinuxPortFixture.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <gmock/gmock.h>

#include <QDBusConnection>
#include <QDBusMessage>
#include <QObject>
#include <QProcess>

#include <chrono>
#include <string>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::IsEmpty;

constexpr const char* domain = "com.velmora.HomeScreen";

class LinuxPreferencesTest : public testing::Test {
protected:
    [[nodiscard]] std::filesystem::path file() const { return directory / "com.velmora.HomeScreen.plist"; }
    [[nodiscard]] Value stored() const {
        const auto content = readFile(file(), 1 << 20);
        if (!content)
            return {};
        const auto value = readPropertyList(content->bytes());
        return value ? *value : Value();
    }
    template <class Content>
    void put(const Content& content) const {
        ASSERT_TRUE(
            writeFile(file(), Bytes(reinterpret_cast<const std::uint8_t*>(content.data()), content.size())));
    }
    static Value dictionary(std::initializer_list<Dictionary::Entry> entries) {
        return Value(std::make_shared<Dictionary>(entries));
    }

    CapturedLog log;
    TemporaryDirectory directory;
    LinuxPreferences preferences{directory.path()};
};

TEST_F(LinuxPreferencesTest, ValueIsWrittenBySynchronizingItsDomain) {
    preferences.setBoolean(domain, "Shown", true);
    EXPECT_FALSE(std::filesystem::exists(file()));
    preferences.synchronize("com.velmora.Other");
    EXPECT_FALSE(std::filesystem::exists(file()));
    preferences.synchronize(domain);
    EXPECT_EQ(stored(), dictionary({{"Shown", true}}));
    EXPECT_THAT(log.lines(), IsEmpty());
}

TEST_F(LinuxPreferencesTest, ValueIsReadAgain) {
    EXPECT_FALSE(preferences.boolean(domain, "Shown"));
    preferences.setBoolean(domain, "Shown", true);
    EXPECT_TRUE(preferences.boolean(domain, "Shown")) << "in this process at once";
    EXPECT_FALSE(LinuxPreferences(directory.path()).boolean(domain, "Shown"));
    preferences.synchronize(domain);
    EXPECT_TRUE(preferences.boolean(domain, "Shown"));
    EXPECT_TRUE(LinuxPreferences(directory.path()).boolean(domain, "Shown"));
    EXPECT_FALSE(preferences.boolean(domain, "Other"));
    EXPECT_FALSE(preferences.boolean("com.velmora.Other", "Shown"));
    preferences.setBoolean(domain, "Shown", false);
    EXPECT_FALSE(preferences.boolean(domain, "Shown"));
    EXPECT_TRUE(log.textsAt(LogPriority::Error).empty());
}

TEST_F(LinuxPreferencesTest, ListThatCannotBeReadHasNoValue) {
    put(std::string("<plist><array/></plist>"));
    EXPECT_FALSE(preferences.boolean(domain, "Shown"));
    EXPECT_THAT(log.textsAt(LogPriority::Error),
                ElementsAre("Preferences: " + file().string() + ": holds array, wanted dictionary"));
}

TEST_F(LinuxPreferencesTest, OtherKeysStay) {
    const Value earlier = dictionary({{"Wallpaper", "stripes"}, {"Shown", true}, {"Rows", 5}});
    put(*writeXMLPropertyList(earlier));
    preferences.setBoolean(domain, "Shown", false);
    preferences.synchronize(domain);
    EXPECT_EQ(stored(), dictionary({{"Wallpaper", "stripes"}, {"Shown", false}, {"Rows", 5}}));
}

TEST_F(LinuxPreferencesTest, BinaryListStaysBinary) {
    put(*writeBinaryPropertyList(dictionary({{"Rows", 5}})));
    preferences.setBoolean(domain, "Shown", true);
    preferences.synchronize(domain);
    const auto content = readFile(file(), 1 << 20);
    ASSERT_TRUE(content);
    EXPECT_EQ(std::string(content->bytes().begin(), content->bytes().begin() + 8), "bplist00");
    EXPECT_EQ(stored(), dictionary({{"Rows", 5}, {"Shown", true}}));
}

TEST_F(LinuxPreferencesTest, LinkStaysALink) {
    std::filesystem::create_directory(directory / "kept");
    const std::filesystem::path target = directory / "kept/list";
    std::filesystem::create_symlink(target, file());
    put(*writeXMLPropertyList(dictionary({})));
    preferences.setBoolean(domain, "Shown", true);
    preferences.synchronize(domain);
    EXPECT_TRUE(std::filesystem::is_symlink(file()));
    EXPECT_EQ(stored(), dictionary({{"Shown", true}}));
}

TEST_F(LinuxPreferencesTest, AnUnreadableListIsNotChangedAndTheValueKept) {
    put(std::string("no list"));
    preferences.setBoolean(domain, "Shown", true);
    preferences.synchronize(domain);
    const auto lines = log.textsAt(LogPriority::Error);
    ASSERT_EQ(lines.size(), 1u);
    EXPECT_TRUE(lines[0].starts_with("Preferences: " + file().string() + ": ")) << lines[0];
    EXPECT_EQ(readFile(file(), 100)->size(), 7u);

    put(*writeXMLPropertyList(Value(makeArray())));
    log.clear();
    preferences.synchronize(domain);
    EXPECT_THAT(log.textsAt(LogPriority::Error),
                ElementsAre("Preferences: " + file().string() + ": holds array, wanted dictionary"));

    std::filesystem::remove(file());
    preferences.synchronize(domain);
    EXPECT_EQ(stored(), dictionary({{"Shown", true}}));
}

TEST_F(LinuxPreferencesTest, DomainThatIsNoFileNameIsRefused) {
    for (const char* name : {"", "../elsewhere", ".hidden", "a/b"}) {
        log.clear();
        preferences.setBoolean(name, "Shown", true);
        EXPECT_THAT(log.textsAt(LogPriority::Error),
                    ElementsAre("Preferences: \"" + std::string(name) + "\" is no domain's name"));
        preferences.synchronize(name);
    }
    EXPECT_TRUE(std::filesystem::is_empty(directory.path()));
}

TEST_F(LinuxPreferencesTest, WithoutABusNoChangeIsAnnounced) {
    LinuxPreferences alone(directory.path(), "unix:path=" + (directory / "none").string());
    alone.announceChange(domain, "Shown");
    EXPECT_THAT(log.lines(),
                ElementsAre(CapturedLog::Line{LogPriority::Info,
                                              "Preferences: no session bus to announce the change on"}));
}

/// Hears the signal on a bus of the test's own.
class PreferencesListener : public QObject {
    Q_OBJECT
public:
    std::vector<std::string> heard;

public slots:
    void changed(const QString& changedDomain, const QString& key) {
        heard.push_back((changedDomain + ' ' + key).toStdString());
    }
};

TEST_F(LinuxPreferencesTest, ChangeIsAnnouncedOnTheBus) {
    QProcess daemon;
    const QString address = QString::fromStdString("unix:path=" + (directory / "bus").string());
    daemon.start("dbus-daemon", {"--session", "--nofork", "--print-address", "--address=" + address});
    if (!daemon.waitForStarted())
        GTEST_SKIP() << "no dbus-daemon on this machine";
    ASSERT_TRUE(daemon.waitForReadyRead());

    PreferencesListener listener;
    {
        auto bus = QDBusConnection::connectToBus(address, "listener");
        ASSERT_TRUE(bus.isConnected()) << bus.lastError().message().toStdString();
        ASSERT_TRUE(bus.connect({}, "/com/velmora/Preferences", "com.velmora.Preferences",
                                "PreferencesChanged", &listener, SLOT(changed(QString, QString))));
        LinuxPreferences announcing(directory.path(), address.toStdString());
        announcing.announceChange(domain, "Shown");
        announcing.announceChange(domain, "Other");
        EXPECT_TRUE(testLoop().runUntil([&] { return listener.heard.size() >= 2; }, 20s));
        EXPECT_THAT(listener.heard,
                    ElementsAre("com.velmora.HomeScreen Shown", "com.velmora.HomeScreen Other"));
        EXPECT_THAT(log.lines(), IsEmpty());
    }
    QDBusConnection::disconnectFromBus("listener");
    daemon.terminate();
    EXPECT_TRUE(daemon.waitForFinished());
}

} // namespace
} // namespace velmora

#include "LinuxPreferencesTest.moc"

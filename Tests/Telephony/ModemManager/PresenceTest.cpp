// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/PartsFixture.h"

/// Modems, ModemManager and the bus come and go; the messages say what is missing.

namespace velmora {
namespace {

using namespace std::chrono_literals;
using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::MatchesRegex;

class PresenceTest : public PartsFixture {
protected:
    /// Waits until messages of the modem with that number come.
    [[nodiscard]] bool showsNumber(const std::string& number) {
        return becomes(LiveModemCode::sim, {"kSimFile_MSISDN"}, array({number}));
    }
    /// Waits until every message has nothing but this presence, and a reason that fits.
    [[nodiscard]] bool isAbsent(ModemPresence presence, const std::string& reason = {}) {
        return passes([&] {
            for (const std::uint32_t code : codes) {
                const Value root = latest(code);
                const Dictionary* members = root.asDictionary();
                const std::string* why = members ? (*members)["kVoxModemReason"].asString() : nullptr;
                if (!members || !((*members)["kVoxModemPresence"] == number(presence)) ||
                    members->size() != (why ? 2U : 1U) || !(why ? *why : std::string()).starts_with(reason))
                    return false;
            }
            return true;
        });
    }
    static InterfaceMap modemWithNumber(const QString& number, const QVariantMap& more = {}) {
        InterfaceMap modem = testModem(lteAccess, {{"OwnNumbers", QStringList(number)}});
        modem[Mock::modem].insert(more);
        return modem;
    }
    void followBusAt(const std::string& address) {
        source = std::make_unique<ModemManagerSource>(queue, clock,
                                                      ModemManagerSource::Options{{{}, address}, {}});
    }
    inline static const QVariantMap withoutSIM = {{"Sim", QVariant::fromValue(QDBusObjectPath("/"))}};
    static constexpr std::initializer_list<std::uint32_t> codes = {
        LiveModemCode::sim,  LiveModemCode::cells,   LiveModemCode::contexts, LiveModemCode::registration,
        LiveModemCode::link, LiveModemCode::traffic, LiveModemCode::modem,    LiveModemCode::position};
};

TEST_F(PresenceTest, theTechnologyIsThereFromTheStartAndStays) {
    follow();
    EXPECT_EQ(source->technology(), kVoxLogChannelTechnology_Modem);
    for (const uint access : {gsmAccess, umtsAccess, lteAccess, nrAccess, 1U << 10, 0U}) {
        mock.put(Mock::modemPath(0), testModem(access));
        drain();
        EXPECT_EQ(source->technology(), kVoxLogChannelTechnology_Modem);
    }
}

TEST_F(PresenceTest, aMissingModemIsReportedOnce) {
    follow();
    listen();
    ASSERT_TRUE(isAbsent(ModemPresence::NoModem));
    queue.advance(10min);
    drain();
    EXPECT_EQ(sink.messages.size(), 8U);
    EXPECT_THAT(warnings(), ElementsAre("modemmanager: no modem is there"));
    // Every client hears of it.
    source->stop();
    listen();
    ASSERT_TRUE(passes([this] { return sink.messages.size() == 16; }));
}

TEST_F(PresenceTest, modemsArePluggedInAndOut) {
    follow();
    listen();
    mock.put(Mock::modemPath(3), modemWithNumber("+3"));
    ASSERT_TRUE(showsNumber("+3"));
    EXPECT_THAT(log.textsAt(LogPriority::Notice), ElementsAre("modemmanager: following modem 3 Test Modem"));
    mock.remove(Mock::modemPath(3));
    ASSERT_TRUE(isAbsent(ModemPresence::NoModem));
    EXPECT_THAT(warnings(), ::testing::Contains("modemmanager: no modem is there"));
    mock.put(Mock::modemPath(4), modemWithNumber("+4"));
    ASSERT_TRUE(showsNumber("+4"));
}

TEST_F(PresenceTest, takesTheFirstModemWithASIM) {
    mock.put(Mock::modemPath(0), modemWithNumber("+0", withoutSIM));
    mock.put(Mock::modemPath(10), modemWithNumber("+10"));
    mock.put(Mock::modemPath(9), modemWithNumber("+9"));
    follow();
    listen();
    ASSERT_TRUE(showsNumber("+9"));
    // A better one does not take it away while it is there.
    mock.put(Mock::modemPath(1), modemWithNumber("+1"));
    drain();
    mock.change(Mock::modemPath(9), Mock::modem, {{"OwnNumbers", QStringList("+99")}});
    ASSERT_TRUE(showsNumber("+99"));
    mock.remove(Mock::modemPath(9));
    ASSERT_TRUE(showsNumber("+1"));
}

TEST_F(PresenceTest, aModemWithoutSIMServesUntilThereIsOneWith) {
    mock.put(Mock::modemPath(2), modemWithNumber("+2", withoutSIM));
    mock.put(Mock::modemPath(5), modemWithNumber("+5", withoutSIM));
    follow();
    listen();
    ASSERT_TRUE(becomes(LiveModemCode::modem, {"kVoxModemIndex"}, 2));
    mock.change(Mock::modemPath(5), Mock::modem,
                {{"Sim", QVariant::fromValue(QDBusObjectPath(Mock::simPath(0)))}});
    ASSERT_TRUE(becomes(LiveModemCode::modem, {"kVoxModemIndex"}, 5));
}

TEST_F(PresenceTest, modemManagerIsRestarted) {
    mock.put(Mock::modemPath(0), modemWithNumber("+0"));
    follow();
    listen();
    ASSERT_TRUE(showsNumber("+0"));
    mock.vanish();
    ASSERT_TRUE(isAbsent(ModemPresence::NoManager));
    EXPECT_THAT(warnings(), ::testing::Contains("modemmanager: ModemManager has gone"));
    ASSERT_TRUE(isAbsent(ModemPresence::NoManager, "org.freedesktop.DBus.Error.NameHasNoOwner: "));
    sink.messages.clear();
    queue.advance(1h);
    drain();
    EXPECT_THAT(sink.messages, IsEmpty());

    mock.put(Mock::simPath(0), {{Mock::sim, {}}});
    mock.put(Mock::modemPath(0), modemWithNumber("+1"));
    mock.appear();
    ASSERT_TRUE(showsNumber("+1"));
}

TEST_F(PresenceTest, startsBeforeModemManager) {
    mock.vanish();
    followBusAt(bus.address());
    listen();
    ASSERT_TRUE(isAbsent(ModemPresence::NoManager, "org.freedesktop.DBus.Error.ServiceUnknown: "));
    EXPECT_THAT(warnings(),
                ElementsAre(MatchesRegex("modemmanager: ModemManager is not there "
                                         "\\(org\\.freedesktop\\.DBus\\.Error\\.ServiceUnknown: .*\\)")));
    queue.advance(10min);
    EXPECT_EQ(warnings().size(), 1U) << "it goes on looking without a word";
    mock.put(Mock::modemPath(0), modemWithNumber("+0"));
    mock.appear();
    EXPECT_TRUE(showsNumber("+0"));
}

TEST_F(PresenceTest, outlivesTheBus) {
    mock.put(Mock::modemPath(0), modemWithNumber("+0"));
    follow();
    listen();
    ASSERT_TRUE(showsNumber("+0"));
    bus.stop();
    ASSERT_TRUE(isAbsent(ModemPresence::NoBus));
    // ModemManager may be seen to go first.
    ASSERT_TRUE(passes([this] { return warnings().back().starts_with("modemmanager: no system bus ("); }));
    queue.advance(10min);
    EXPECT_THAT(warnings(), ::testing::Contains("modemmanager: the system bus has gone"));
    EXPECT_THAT(warnings(),
                ::testing::Contains(::testing::StartsWith("modemmanager: no system bus (")).Times(1));
}

TEST_F(PresenceTest, thereIsNoBus) {
    followBusAt("unix:path=/nonexistent/velmora-bus");
    listen();
    ASSERT_TRUE(isAbsent(ModemPresence::NoBus));
    EXPECT_FALSE(latest(LiveModemCode::cells, {"kVoxModemReason"}).isNone());
    queue.advance(10min);
    EXPECT_THAT(warnings(), ElementsAre(MatchesRegex("modemmanager: no system bus \\(.*\\)")));
}

TEST_F(PresenceTest, aModemManagerThatDoesNotAnswer) {
    mock.put(Mock::modemPath(0), modemWithNumber("+0"));
    mock.held = "GetManagedObjects";
    followBusAt(bus.address());
    listen();
    ASSERT_TRUE(isAbsent(ModemPresence::NoAnswer));
    EXPECT_GE(clock.now() - FakeClock::defaultNow(), 2s);
    mock.release();
    EXPECT_TRUE(showsNumber("+0"));
}

TEST_F(PresenceTest, aModemThatCannotBeUsedSaysWhy) {
    mock.put(Mock::modemPath(0), testModem(0, {{"State", 2}, {"UnlockRequired", 2U}}));
    follow();
    listen();
    ASSERT_TRUE(becomes(LiveModemCode::sim, {"kVoxModemLock"}, 2));
    for (const std::uint32_t code : codes) {
        EXPECT_EQ(latest(code, {"kVoxModemLock"}), Value(2));
        EXPECT_EQ(latest(code, {"kVoxModemState"}), Value(2));
        EXPECT_TRUE(latest(code, {"kVoxModemFailedReason"}).isNone());
    }
    // The second PIN protects features of the SIM, not the modem.
    mock.change(Mock::modemPath(0), Mock::modem, {{"State", 8}, {"UnlockRequired", 3U}});
    ASSERT_TRUE(becomes(LiveModemCode::cells, {"kVoxModemLock"}, {}));
    mock.change(Mock::modemPath(0), Mock::modem,
                {{"State", -1}, {"UnlockRequired", 1U}, {"StateFailedReason", 2U}});
    ASSERT_TRUE(becomes(LiveModemCode::cells, {"kVoxModemFailedReason"}, 2));
    EXPECT_EQ(latest(LiveModemCode::cells, {"kVoxModemState"}), Value(-1));
    EXPECT_THAT(warnings(),
                ::testing::IsSupersetOf({"modemmanager: modem 0 is locked (SIM PIN)",
                                         "modemmanager: modem 0 has failed (the SIM is missing)"}));
    mock.change(Mock::modemPath(0), Mock::modem, {{"State", 8}});
    EXPECT_TRUE(becomes(LiveModemCode::cells, {"kVoxModemFailedReason"}, {}))
        << "that was the earlier failure";
}

TEST_F(PresenceTest, rubbishOfTheObjectManagerIsNoModem) {
    follow();
    const QString manager = QStringLiteral("org.freedesktop.DBus.ObjectManager");
    const QString root = QStringLiteral("/org/freedesktop/ModemManager1");
    const auto path = [](const char* text) { return QVariant::fromValue(QDBusObjectPath(text)); };
    const auto interfaces = QVariant::fromValue(testModem(lteAccess));
    const QVariantList added[] = {
        {},
        {1U},
        {"/org/freedesktop/ModemManager1/Modem/1"},
        {path("/org/freedesktop/ModemManager1/Modem/1"), "interfaces"},
        {path("/org/freedesktop/ModemManager1/Modem/1"), QVariantMap{{"x", 1U}}},
        {path("/org/freedesktop/ModemManager1/Modem/one"), interfaces},
        {path("/org/freedesktop/ModemManager1/Modem/1/x"), interfaces},
        {path("/org/freedesktop/ModemManager1/Modem/99999999999"), interfaces},
        {path("/org/freedesktop/ModemManager1/SIM/1"), interfaces},
        {path("/"), interfaces},
    };
    for (const QVariantList& arguments : added) {
        mock.emitSignal(root, manager, "InterfacesAdded", arguments);
        mock.emitSignal(root, manager, "InterfacesRemoved", arguments);
        mock.emitSignal(Mock::modemPath(1), "org.freedesktop.DBus.Properties", "PropertiesChanged",
                        arguments);
    }
    mock.emitSignal(root, manager, "InterfacesRemoved", {path("/org/freedesktop/ModemManager1/Modem/1"), 5U});
    drain();
    EXPECT_THAT(warnings(), ElementsAre("modemmanager: no modem is there"));
    mock.put(Mock::modemPath(1), testModem(lteAccess));
    drain();
    listen();
    EXPECT_TRUE(becomes(LiveModemCode::modem, {"kVoxModemIndex"}, 1));
}

TEST_F(PresenceTest, rubbishInPlaceOfTheModemsIsNone) {
    for (const QVariant& rubbish : {QVariant(5U), QVariant("modems"), QVariant(QStringList("modem")),
                                    QVariant(QVariantMap{{"/org/freedesktop/ModemManager1/Modem/0", 1U}})}) {
        mock.answers["GetManagedObjects"] = {{rubbish}, {}, {}};
        follow();
        listen();
        EXPECT_TRUE(isAbsent(ModemPresence::NoModem));
        source->stop();
    }
    mock.answers["GetManagedObjects"] = {{}, "org.freedesktop.DBus.Error.AccessDenied", "not yours\n\x01"};
    follow();
    listen();
    EXPECT_TRUE(isAbsent(ModemPresence::NoPermission, "org.freedesktop.DBus.Error.AccessDenied: not yours"));
    source->stop();
    EXPECT_THAT(warnings(),
                ::testing::Contains("modemmanager: no permission to ask ModemManager for its modems "
                                    "(org.freedesktop.DBus.Error.AccessDenied: not yours?\?)"));
    mock.answers["GetManagedObjects"] = {{}, "org.freedesktop.DBus.Error.Failed", QString(4000, 'x')};
    follow();
    listen();
    EXPECT_TRUE(isAbsent(ModemPresence::NoAnswer, "org.freedesktop.DBus.Error.Failed: xxx"));
    EXPECT_EQ(warnings().back(), "modemmanager: ModemManager does not say which modems there are "
                                 "(org.freedesktop.DBus.Error.Failed: " +
                                     std::string(200, 'x') + ")");
    mock.answers.clear();
    mock.put(Mock::modemPath(0), testModem(gsmAccess));
    ASSERT_TRUE(becomes(LiveModemCode::modem, {"kVoxModemIndex"}, 0)) << "it is asked again";
}

} // namespace
} // namespace velmora

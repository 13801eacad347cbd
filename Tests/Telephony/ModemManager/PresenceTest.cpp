// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/ModemManagerFixture.h"

#include "Platform/TelephonyService.h"

/// Modems, ModemManager and the bus come and go; the technology follows.

namespace velmora {
namespace {

using namespace std::chrono_literals;
using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::MatchesRegex;

class PresenceTest : public ModemManagerTest {
protected:
    /// Waits until records of the modem with that SIM come.
    [[nodiscard]] bool showsNumber(const std::string& number) {
        return passes([&] { return at(latest(simCode), {"kSimFile_MSISDN"}) == Value(number); });
    }
    static InterfaceMap modemWithNumber(const QString& number, const QVariantMap& more = {}) {
        InterfaceMap modem = testModem(lteAccess, {{"OwnNumbers", QStringList(number)}});
        modem[Mock::modem].insert(more);
        return modem;
    }
    inline static const QVariantMap withoutSIM = {{"Sim", QVariant::fromValue(QDBusObjectPath("/"))}};
};

TEST_F(PresenceTest, aMissingModemIsReportedOnceAndHasNoTechnology) {
    follow();
    EXPECT_EQ(source->technology(), "");
    listen();
    queue.advance(10min);
    drain();
    EXPECT_THAT(sink.messages, IsEmpty());
    EXPECT_THAT(warnings(), ElementsAre("modemmanager: no modem is there"));
    EXPECT_EQ(changes, 0);
}

TEST_F(PresenceTest, modemsArePluggedInAndOut) {
    follow();
    listen();
    mock.put(Mock::modemPath(3), modemWithNumber("+3"));
    ASSERT_TRUE(showsNumber("+3"));
    EXPECT_EQ(source->technology(), kVoxLogChannelTechnology_Ostrel_LTE);
    EXPECT_EQ(changes, 1);
    EXPECT_THAT(log.textsAt(LogPriority::Notice),
                ElementsAre("modemmanager: following modem 3 Test Modem",
                            "modemmanager: the technology is Ostrel_LTE now"));
    mock.answers["GetCellInfo"] = {
        {QVariant::fromValue(CellList{{{"cell-type", 5U}, {"serving", true}, {"tac", "7"}}})}, {}, {}};
    ASSERT_TRUE(passes([this] { return count(cellCode) > 0; }));

    mock.remove(Mock::modemPath(3));
    ASSERT_TRUE(comes([this] { return at(latest(cellCode), {}) == Value(makeArray()); }));
    EXPECT_EQ(latest(contextCode), Value(makeArray())) << "nothing of it stays on the screen";
    EXPECT_EQ(source->technology(), kVoxLogChannelTechnology_Ostrel_LTE) << "for the screen that is there";
    EXPECT_THAT(warnings(), ::testing::Contains("modemmanager: no modem is there"));

    mock.put(Mock::modemPath(4), modemWithNumber("+4"));
    ASSERT_TRUE(showsNumber("+4"));
    EXPECT_EQ(changes, 1);
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
    ASSERT_TRUE(showsNumber("+2"));
    mock.change(Mock::modemPath(5), Mock::modem,
                {{"Sim", QVariant::fromValue(QDBusObjectPath(Mock::simPath(0)))}});
    ASSERT_TRUE(showsNumber("+5"));
}

TEST_F(PresenceTest, takesTheModemThatIsWanted) {
    mock.put(Mock::modemPath(0), modemWithNumber("+0"));
    mock.put(Mock::modemPath(2), modemWithNumber("+2"));
    follow(7);
    EXPECT_THAT(warnings(), ElementsAre("modemmanager: no modem 7 is there, only: 0, 2"));
    EXPECT_EQ(source->technology(), "");
    listen();
    mock.put(Mock::modemPath(7), modemWithNumber("+7", withoutSIM));
    ASSERT_TRUE(showsNumber("+7"));
}

TEST_F(PresenceTest, modemManagerIsRestarted) {
    mock.put(Mock::modemPath(0), modemWithNumber("+0"));
    follow();
    listen();
    ASSERT_TRUE(showsNumber("+0"));
    mock.vanish();
    ASSERT_TRUE(comes([this] { return latest(contextCode) == Value(makeArray()); }));
    EXPECT_THAT(warnings(), ::testing::Contains("modemmanager: ModemManager has gone"));
    sink.messages.clear();
    queue.advance(1h);
    drain();
    EXPECT_THAT(sink.messages, IsEmpty());

    mock.put(Mock::simPath(0), {{Mock::sim, {}}});
    mock.put(Mock::modemPath(0), modemWithNumber("+1"));
    mock.appear();
    ASSERT_TRUE(showsNumber("+1"));
    EXPECT_EQ(changes, 1) << "it speaks the same technology as before";
}

TEST_F(PresenceTest, startsBeforeModemManager) {
    mock.vanish();
    source = std::make_unique<ModemManagerSource>(queue, clock, ModemFollower::Options{{}, bus.address()});
    ASSERT_TRUE(passes([this] { return !warnings().empty(); }));
    EXPECT_THAT(warnings(),
                ElementsAre(MatchesRegex("modemmanager: ModemManager is not there "
                                         "\\(org\\.freedesktop\\.DBus\\.Error\\.ServiceUnknown: .*\\)")));
    queue.advance(10min);
    EXPECT_EQ(warnings().size(), 1U) << "it goes on looking without a word";
    listen();
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
    ASSERT_TRUE(comes([this] { return latest(contextCode) == Value(makeArray()); }));
    // ModemManager may be seen to go first.
    ASSERT_TRUE(passes([this] { return warnings().back().starts_with("modemmanager: no system bus ("); }));
    queue.advance(10min);
    EXPECT_THAT(warnings(), ::testing::Contains("modemmanager: the system bus has gone"));
    EXPECT_THAT(warnings(),
                ::testing::Contains(::testing::StartsWith("modemmanager: no system bus (")).Times(1));
}

TEST_F(PresenceTest, thereIsNoBus) {
    source = std::make_unique<ModemManagerSource>(
        queue, clock, ModemFollower::Options{{}, "unix:path=/nonexistent/velmora-bus"});
    listen();
    queue.advance(10min);
    EXPECT_THAT(warnings(), ElementsAre(MatchesRegex("modemmanager: no system bus \\(.*\\)")));
    EXPECT_EQ(source->technology(), "");
}

/// What a modem says of its technology, and the technology that it comes to.
struct Technology {
    const char* name;
    uint access;
    uint capabilities;
    std::string_view technology;
};

class TechnologyTest : public ModemManagerTest, public ::testing::WithParamInterface<Technology> {};

TEST_P(TechnologyTest, followsTheModem) {
    mock.put(Mock::modemPath(0),
             testModem(GetParam().access, {{"CurrentCapabilities", GetParam().capabilities}}));
    follow();
    EXPECT_EQ(source->technology(), GetParam().technology);
}

constexpr std::string_view gsm = kVoxLogChannelTechnology_Ostrel_GSM;
constexpr std::string_view lte = kVoxLogChannelTechnology_Ostrel_LTE;

INSTANTIATE_TEST_SUITE_P(
    All, TechnologyTest,
    ::testing::Values(Technology{"gsm", 1U << 1, 0, gsm}, Technology{"gsmCompact", 1U << 2, 0, gsm},
                      Technology{"gprs", 1U << 3, 0, gsm}, Technology{"edge", 1U << 4, 0, gsm},
                      Technology{"umts", 1U << 5, 0, gsm}, Technology{"hsdpa", 1U << 6, 0, gsm},
                      Technology{"hsupa", 1U << 7, 0, gsm}, Technology{"hspa", 1U << 8, 0, gsm},
                      Technology{"hspaPlus", 1U << 9, 0, gsm}, Technology{"lte", 1U << 14, 0, lte},
                      Technology{"nr", 1U << 15, 0, lte}, Technology{"catM", 1U << 16, 0, lte},
                      Technology{"nbIoT", 1U << 17, 0, lte},
                      Technology{"lteBesideUMTS", 1U << 14 | 1U << 5, 0, lte},
                      Technology{"onNoNetwork", 0, 1U << 2 | 1U << 3, lte},
                      Technology{"onNoNetworkWithoutLTE", 0, 1U << 2, gsm},
                      Technology{"onNoNetworkWith5G", 0, 1U << 6, lte},
                      Technology{"pots", 1U << 0, 1U << 0, ""}, Technology{"cdma2000", 1U << 10, 1U << 1, ""},
                      Technology{"evdo", 1U << 12, 1U << 1, ""}, Technology{"nothing", 0, 0, ""}),
    [](const auto& test) { return std::string(test.param.name); });

TEST_F(PresenceTest, aChangedTechnologyIsReported) {
    mock.put(Mock::modemPath(0), testModem(lteAccess));
    follow();
    EXPECT_EQ(changes, 1);
    const auto becomes = [this](const QVariant& access) {
        mock.change(Mock::modemPath(0), Mock::modem, {{"AccessTechnologies", access}});
        drain();
    };
    becomes(umtsAccess);
    EXPECT_EQ(source->technology(), gsm);
    EXPECT_EQ(changes, 2);
    // Neither another of the same decoder's, nor none at all, nor rubbish changes anything.
    for (const QVariant& access : {QVariant(gsmAccess), QVariant(0U), QVariant(1U << 10), QVariant(-1),
                                   QVariant("LTE"), QVariant(QStringList("LTE")), QVariant(16384.0)})
        becomes(access);
    mock.invalidate(Mock::modemPath(0), Mock::modem, {"AccessTechnologies"});
    drain();
    EXPECT_EQ(source->technology(), gsm);
    EXPECT_EQ(changes, 2);
    becomes(lteAccess | nrAccess);
    EXPECT_EQ(source->technology(), lte);
    EXPECT_EQ(changes, 3);
    EXPECT_THAT(sink.messages, IsEmpty()) << "no client listens";
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
    EXPECT_EQ(source->technology(), "");
    EXPECT_THAT(warnings(), ElementsAre("modemmanager: no modem is there"));
    mock.put(Mock::modemPath(1), testModem(lteAccess));
    drain();
    EXPECT_EQ(source->technology(), lte);
}

TEST_F(PresenceTest, rubbishInPlaceOfTheModemsIsNone) {
    for (const QVariant& rubbish : {QVariant(5U), QVariant("modems"), QVariant(QStringList("modem")),
                                    QVariant(QVariantMap{{"/org/freedesktop/ModemManager1/Modem/0", 1U}})}) {
        mock.answers["GetManagedObjects"] = {{rubbish}, {}, {}};
        follow();
        EXPECT_EQ(source->technology(), "");
    }
    mock.answers["GetManagedObjects"] = {{}, "org.freedesktop.DBus.Error.AccessDenied", "not yours\n\x01"};
    follow();
    EXPECT_THAT(warnings(),
                ::testing::Contains("modemmanager: no permission to ask ModemManager for its modems "
                                    "(org.freedesktop.DBus.Error.AccessDenied: not yours?\?)"));
    mock.answers["GetManagedObjects"] = {{}, "org.freedesktop.DBus.Error.Failed", QString(4000, 'x')};
    follow();
    EXPECT_EQ(warnings().back(), "modemmanager: ModemManager does not say which modems there are "
                                 "(org.freedesktop.DBus.Error.Failed: " +
                                     std::string(200, 'x') + ")");
    mock.answers.clear();
    mock.put(Mock::modemPath(0), testModem(gsmAccess));
    ASSERT_TRUE(passes([this] { return source->technology() == gsm; })) << "it is asked again";
}

} // namespace
} // namespace velmora

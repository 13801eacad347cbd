// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/ModemManagerFixture.h"

#include "Platform/TelephonyService.h"

/// When the modem is asked, how often, and what is done where it does not answer.

namespace velmora {
namespace {

using namespace std::chrono_literals;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

const CellList oneCell = {{{"cell-type", 5U}, {"serving", true}, {"tac", "7"}}};

class AskingTest : public ModemManagerTest {
protected:
    explicit AskingTest(const std::string& rules = {}) : ModemManagerTest(rules) {
        modem[Mock::location] = {{"Enabled", 1U}};
        modem[Mock::signal] = {{"Rate", 0U}};
        mock.answers["GetCellInfo"] = {{QVariant::fromValue(oneCell)}, {}, {}};
        mock.answers["GetLocation"] = {{QVariant::fromValue(LocationMap())}, {}, {}};
        mock.answers["Setup"] = {{}, {}, {}};
    }

    void put() { mock.put(Mock::modemPath(0), modem); }
    void refuse(const QString& member, const QString& error, const QString& text) {
        mock.answers[member] = {{}, error, text};
    }
    /// The rates that Setup was called with.
    std::vector<uint> rates() const {
        std::vector<uint> set;
        for (const Mock::Call& call : mock.calls)
            if (call.member == "Setup") {
                EXPECT_EQ(call.path, Mock::modemPath(0));
                EXPECT_EQ(call.arguments.size(), 1);
                set.push_back(call.arguments.value(0).toUInt());
            }
        return set;
    }

    InterfaceMap modem = testModem(lteAccess);
};

TEST_F(AskingTest, nothingIsRequestedWithoutAListener) {
    put();
    follow();
    queue.advance(1h);
    drain();
    listen();
    ASSERT_TRUE(
        passes([this] { return count(cellCode) > 0 && count(simCode) > 0 && count(contextCode) > 0; }));
    source->stop();
    drain();
    const std::size_t records = sink.messages.size();
    mock.calls.clear();
    queue.advance(1h);
    mock.change(Mock::modemPath(0), Mock::modem, {{"State", 11}});
    drain();
    for (const Mock::Call& call : mock.calls)
        EXPECT_EQ(call.member, "Ping");
    EXPECT_EQ(sink.messages.size(), records);

    mock.calls.clear();
    listen();
    EXPECT_TRUE(comes([this] { return mock.count("GetCellInfo") == 1; }));
    sink.messages.clear();
    EXPECT_TRUE(passes([&] { return count(simCode) > 0 && count(contextCode) > 0; })) << "sent again";
}

TEST_F(AskingTest, cellsAreAskedEveryThreeSecondsAndNeverTwiceAtATime) {
    put();
    follow();
    listen();
    ASSERT_TRUE(comes([this] { return count(cellCode) == 1; }));
    for (std::size_t turn = 2; turn < 5; ++turn) {
        queue.advance(2999ms);
        drain();
        EXPECT_EQ(mock.count("GetCellInfo"), turn - 1);
        queue.advance(1ms);
        ASSERT_TRUE(comes([&] { return count(cellCode) == turn; })) << "each measurement is sent";
    }
    mock.held = "GetCellInfo";
    queue.advance(3s);
    ASSERT_TRUE(comes([this] { return mock.count("GetCellInfo") == 5; }));
    queue.advance(1h);
    mock.change(Mock::modemPath(0), Mock::modem, {{"State", 11}});
    drain();
    EXPECT_EQ(mock.count("GetCellInfo"), 5U);
    mock.release();
    ASSERT_TRUE(comes([this] { return count(cellCode) == 5; }));
    EXPECT_EQ(mock.count("GetLocation"), 0U) << "the serving cell is known";
}

TEST_F(AskingTest, anAnswerAfterTheEndIsIgnored) {
    put();
    follow();
    mock.held = "GetCellInfo";
    listen();
    ASSERT_TRUE(comes([this] { return mock.count("GetCellInfo") == 1; }));
    source->stop();
    mock.release();
    drain();
    EXPECT_EQ(count(cellCode), 0U);
}

TEST_F(AskingTest, theSinkMayStopTheSource) {
    put();
    follow();
    sink.onTake = [this] { source->stop(); };
    for (std::size_t records = 1; records <= 3; ++records) {
        listen();
        ASSERT_TRUE(passes([&] { return sink.messages.size() == records; }));
        queue.advance(1min);
        drain();
        EXPECT_EQ(sink.messages.size(), records);
    }
}

TEST_F(AskingTest, anUnsupportedRequestIsReportedOnceAndRetriedAfterAMinute) {
    refuse("GetCellInfo", "org.freedesktop.ModemManager1.Error.Core.Unsupported", "no cells");
    refuse("GetLocation", "org.freedesktop.ModemManager1.Error.Core.Unauthorized", "no place");
    refuse("Setup", "org.freedesktop.ModemManager1.Error.Core.Unsupported", "no levels");
    put();
    follow();
    listen();
    ASSERT_TRUE(passes([this] { return mock.count("GetCellInfo") == 4; }));
    EXPECT_THAT(warnings(), ::testing::UnorderedElementsAre(
                                "modemmanager: modem 0 does not support cell information "
                                "(org.freedesktop.ModemManager1.Error.Core.Unsupported: no cells)",
                                "modemmanager: no permission to ask modem 0 for its place in the network "
                                "(org.freedesktop.ModemManager1.Error.Core.Unauthorized: no place)",
                                "modemmanager: modem 0 does not support its levels "
                                "(org.freedesktop.ModemManager1.Error.Core.Unsupported: no levels)"));
    EXPECT_GE(clock.now() - FakeClock::defaultNow(), 3 * 60s) << "four times in three minutes";
    EXPECT_LE(clock.now() - FakeClock::defaultNow(), 3 * 60s + 20s);
    EXPECT_LE(mock.count("GetLocation"), 4U);
    EXPECT_EQ(mock.count("Setup"), 1U);
    EXPECT_EQ(count(cellCode), 0U);
    // The rest goes on.
    EXPECT_EQ(at(latest(simCode), {"kSimFile_ICCID"}), Value("89011010000000000017"));
    EXPECT_EQ(at(latest(contextCode), {"0", "Signal Quality"}), Value("60 %"));

    mock.answers["GetCellInfo"] = {{QVariant::fromValue(oneCell)}, {}, {}};
    mock.answers["Setup"] = {{}, {}, {}};
    mock.change(Mock::modemPath(0), Mock::modem, {{"State", 11}});
    EXPECT_TRUE(passes([this] { return count(cellCode) == 1 && rates().size() == 2; }))
        << "another state of the modem is a reason to try";
    // Cleared in between, it is reported again.
    refuse("GetCellInfo", "org.freedesktop.ModemManager1.Error.Core.Unsupported", "no cells");
    EXPECT_TRUE(passes([this] { return warnings().size() == 4; }));
    EXPECT_EQ(latest(cellCode), Value(makeArray())) << "what is not known any more is not shown any more";
}

TEST_F(AskingTest, otherFailuresAreTriedAgainAtTheNextTurn) {
    refuse("GetCellInfo", "org.freedesktop.ModemManager1.Error.Core.WrongState", "device not yet enabled");
    put();
    follow();
    listen();
    ASSERT_TRUE(comes([this] { return mock.count("GetLocation") == 1; }));
    drain();
    for (std::size_t turn = 2; turn < 5; ++turn) {
        queue.advance(3s);
        ASSERT_TRUE(comes([&] { return mock.count("GetLocation") == turn; }));
        drain();
        EXPECT_EQ(mock.count("GetCellInfo"), turn);
    }
    EXPECT_THAT(warnings(),
                ElementsAre("modemmanager: modem 0 does not give cell information "
                            "(org.freedesktop.ModemManager1.Error.Core.WrongState: device not yet "
                            "enabled)"));
}

TEST_F(AskingTest, theRateOfTheLevelsIsSetAndPutBack) {
    put();
    follow();
    listen();
    ASSERT_TRUE(comes([this] { return rates().size() == 1; }));
    // ModemManager signals the new rate, which is no reason to set it again.
    mock.change(Mock::modemPath(0), Mock::signal, {{"Rate", 5U}});
    drain();
    source->stop();
    ASSERT_TRUE(comes([this] { return rates().size() == 2; }));
    EXPECT_THAT(rates(), ElementsAre(5U, 0U));
}

TEST_F(AskingTest, aSlowerForeignRateIsRestoredAndAFasterOneKept) {
    modem[Mock::signal] = {{"Rate", 30U}};
    put();
    follow();
    listen();
    ASSERT_TRUE(comes([this] { return rates().size() == 1; }));
    source->stop();
    ASSERT_TRUE(comes([this] { return rates().size() == 2; }));
    mock.change(Mock::modemPath(0), Mock::signal, {{"Rate", 2U}});
    drain();
    listen();
    ASSERT_TRUE(passes([this] { return count(cellCode) == 2; }));
    source->stop();
    drain();
    EXPECT_THAT(rates(), ElementsAre(5U, 30U));
}

TEST_F(AskingTest, theLevelsAreSetUpOnceTheModemHasThem) {
    modem.remove(Mock::signal);
    modem.remove(Mock::location);
    put();
    follow();
    listen();
    ASSERT_TRUE(passes([this] { return count(cellCode) == 2; }));
    EXPECT_THAT(rates(), IsEmpty());
    mock.put(Mock::modemPath(0), {{Mock::signal, {{"Rate", 0U}}}});
    ASSERT_TRUE(comes([this] { return rates().size() == 1; }));
    mock.removeInterface(Mock::modemPath(0), Mock::signal);
    drain();
    mock.put(Mock::modemPath(0), {{Mock::signal, {{"Rate", 0U}}}});
    ASSERT_TRUE(comes([this] { return rates().size() == 2; }));
    source.reset();
    ASSERT_TRUE(comes([this] { return rates().size() == 3; }));
    EXPECT_THAT(rates(), ElementsAre(5U, 5U, 0U));
}

/// A bus as Debian configures the system's: what its policy does not list, it refuses to all but root.
class DenyingBusTest : public AskingTest {
protected:
    DenyingBusTest()
        : AskingTest(
              "<deny send_interface=\"org.freedesktop.ModemManager1.Modem\" send_member=\"GetCellInfo\"/>") {}
};

TEST_F(DenyingBusTest, theLocationReplacesCellsThatMayNotBeQueried) {
    mock.answers["GetLocation"] = {
        {QVariant::fromValue(LocationMap{{1U, QDBusVariant(QString("001,01,0000,1A2D003,1005"))}})}, {}, {}};
    put();
    follow();
    listen();
    ASSERT_TRUE(passes([this] { return count(cellCode) == 2; }));
    EXPECT_EQ(mock.count("GetCellInfo"), 0U) << "the bus keeps it";
    EXPECT_EQ(at(latest(cellCode), {"0", "kVoxCellMonitorTAC"}), Value(4101));
    ASSERT_EQ(warnings().size(), 1U);
    EXPECT_THAT(warnings()[0],
                ::testing::StartsWith("modemmanager: no permission to ask modem 0 for cell information "
                                      "(org.freedesktop.DBus.Error.AccessDenied: "));
}

} // namespace
} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/CellsFixture.h"

#include <fstream>
#include <iterator>

/// When the modem is asked, how often, and what is done where it does not answer.

namespace velmora {
namespace {

using namespace std::chrono_literals;
using ::testing::ElementsAre;

const CellList oneCell = {{{"cell-type", 5U}, {"serving", true}, {"tac", "7"}}};

class AskingTest : public CellsFixture {
protected:
    explicit AskingTest(const std::string& rules = {}) : CellsFixture(rules) {
        modem[Mock::location] = {{"Enabled", 1U}};
        modem[Mock::signal] = {{"Rate", 0U}};
        mock.answers["GetCellInfo"] = {{QVariant::fromValue(oneCell)}, {}, {}};
        mock.answers["GetLocation"] = {{QVariant::fromValue(LocationMap())}, {}, {}};
        mock.answers["Setup"] = {{}, {}, {}};
    }

    void put() { mock.put(Mock::modemPath(0), modem); }

    InterfaceMap modem = testModem(lteAccess);
};

TEST_F(AskingTest, nothingIsRequestedWithoutAListener) {
    put();
    follow();
    queue.advance(1h);
    drain();
    listen();
    ASSERT_TRUE(passes([this] {
        return count(LiveModemCode::cells) > 0 && count(LiveModemCode::sim) > 0 &&
               count(LiveModemCode::contexts) > 0;
    }));
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
    EXPECT_TRUE(passes([&] { return count(LiveModemCode::sim) > 0 && count(LiveModemCode::contexts) > 0; }))
        << "sent again";
}

TEST_F(AskingTest, cellsAreAskedEveryThreeSecondsAndNeverTwiceAtATime) {
    put();
    follow();
    listen();
    ASSERT_TRUE(comes([this] { return count(LiveModemCode::cells) == 1; }));
    for (std::size_t turn = 2; turn < 5; ++turn) {
        queue.advance(2999ms);
        drain();
        EXPECT_EQ(mock.count("GetCellInfo"), turn - 1);
        queue.advance(1ms);
        ASSERT_TRUE(comes([&] { return count(LiveModemCode::cells) == turn; })) << "each measurement is sent";
    }
    // An answer may take ten seconds and more; meanwhile all else goes on.
    mock.held = "GetCellInfo";
    queue.advance(3s);
    ASSERT_TRUE(comes([this] { return mock.count("GetCellInfo") == 5; }));
    queue.advance(10s);
    mock.change(Mock::modemPath(0), Mock::modem, {{"SignalQuality", QVariant::fromValue(Quality{17, true})}});
    EXPECT_TRUE(becomes(LiveModemCode::link, {"kVoxLinkSignalQuality"}, 17));
    EXPECT_EQ(mock.count("GetCellInfo"), 5U);
    const std::size_t before = count(LiveModemCode::cells);
    mock.release();
    ASSERT_TRUE(comes([&] { return count(LiveModemCode::cells) == before + 1; }));
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
    EXPECT_TRUE(sink.messages.empty());
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
    EXPECT_EQ(inCells("kVoxModemCellReport"), number(ModemCellReport::Unsupported));
    // The rest goes on.
    EXPECT_EQ(latest(LiveModemCode::sim, {"kSimFile_ICCID"}), Value("89011010000000000017"));
    EXPECT_EQ(latest(LiveModemCode::link, {"kVoxLinkSignalQuality"}), Value(60));

    mock.answers["GetCellInfo"] = {{QVariant::fromValue(oneCell)}, {}, {}};
    mock.answers["Setup"] = {{}, {}, {}};
    mock.change(Mock::modemPath(0), Mock::modem, {{"State", 11}});
    EXPECT_TRUE(passes([this] {
        return inCells("kVoxModemCellReport") == number(ModemCellReport::Reported) &&
               mock.count("Setup") == 2;
    })) << "another state of the modem is a reason to try";
    // Cleared in between, it is reported again.
    refuse("GetCellInfo", "org.freedesktop.ModemManager1.Error.Core.Unsupported", "no cells");
    EXPECT_TRUE(passes([this] { return warnings().size() == 4; }));
    EXPECT_TRUE(becomes(LiveModemCode::cells, {"kVoxCellMonitorCells"}, array({})))
        << "what is not known any more is not shown";
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

/// A bus as Debian configures the system's: what its policy does not list, it refuses to all but root.
class DenyingBusTest : public AskingTest {
protected:
    DenyingBusTest()
        : AskingTest(
              "<deny send_interface=\"org.freedesktop.ModemManager1.Modem\" send_member=\"GetCellInfo\"/>") {}
};

TEST_F(DenyingBusTest, theLocationReplacesCellsThatMayNotBeQueried) {
    setPlace("001,01,0000,1A2D003,1005");
    put();
    follow();
    listen();
    EXPECT_EQ(at(cells(), {"0", "kVoxCellMonitorTAC"}), Value(4101));
    EXPECT_EQ(mock.count("GetCellInfo"), 0U) << "the bus keeps it";
    EXPECT_EQ(inCells("kVoxModemCellReport"), number(ModemCellReport::NoPermission));
    ASSERT_EQ(warnings().size(), 1U);
    EXPECT_THAT(warnings()[0],
                ::testing::AllOf(
                    ::testing::StartsWith("modemmanager: no permission to ask modem 0 for cell information "
                                          "(org.freedesktop.DBus.Error.AccessDenied: "),
                    ::testing::EndsWith("; velmora-modemmanager.conf allows it, see velmora-telephonyd(1)")));
}

/// The same bus with the policy that comes with the package.
class AllowingBusTest : public AskingTest {
protected:
    AllowingBusTest() : AskingTest(denial + rules()) {}

    inline static const std::string denial =
        "<deny send_destination=\"org.freedesktop.ModemManager1\" send_type=\"method_call\"/>"
        "<allow send_interface=\"org.freedesktop.DBus.Properties\"/>"
        "<allow send_interface=\"org.freedesktop.DBus.ObjectManager\"/>"
        "<allow send_interface=\"com.velmora.Test\"/>";
    /// What is between the policy's tags.
    static std::string rules() {
        std::ifstream file(VELMORA_SOURCE_DIR "/Resources/velmora-modemmanager.conf");
        const std::string text{std::istreambuf_iterator<char>(file), {}};
        constexpr std::string_view begin = "<policy context=\"default\">";
        const std::size_t from = text.find(begin) + begin.size();
        return text.substr(from, text.find("</policy>") - from);
    }
};

TEST_F(AllowingBusTest, thePackagesPolicyAllowsTheCellsAndNothingElse) {
    put();
    follow();
    listen();
    EXPECT_EQ(at(cells(), {"0", "kVoxCellMonitorTAC"}), Value(7));
    EXPECT_EQ(inCells("kVoxModemCellReport"), number(ModemCellReport::Reported));
    EXPECT_EQ(mock.count("Setup"), 0U) << "the bus keeps it";
}

} // namespace
} // namespace velmora

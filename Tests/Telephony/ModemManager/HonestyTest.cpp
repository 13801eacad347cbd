// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/PartsFixture.h"

#include "LogGenerator/LogGenerator.h"
#include "PropertyLists/PropertyList.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Support/ShippedResources.h"

#include <algorithm>
#include <iterator>
#include <map>

/// After a loss no old value is in any message or on the screen, one poll later.

namespace velmora {
namespace {

using namespace std::chrono_literals;

/// Each value of the first modem's holds one of these, which no other modem, cell or SIM has.
const std::string marks[] = {"111", "11.1", "Elder"};

/// The sections that show a message.
const std::map<std::uint32_t, std::vector<const char*>> sections = {
    {LiveModemCode::sim, {"SIM", "SIM Slots"}},
    {LiveModemCode::cells, {"Serving Cell", "Secondary Cell", "Neighbor Cells"}},
    {LiveModemCode::contexts, {"Packet Data Contexts"}},
    {LiveModemCode::registration, {"Registration"}},
    {LiveModemCode::link, {"Link"}},
    {LiveModemCode::traffic, {"Traffic"}},
    {LiveModemCode::modem, {"Modem"}},
    {LiveModemCode::position, {"Position"}},
};

bool hasMark(const std::string& text) {
    return std::any_of(std::begin(marks), std::end(marks),
                       [&](const std::string& mark) { return text.find(mark) != std::string::npos; });
}

std::string textOf(const Value& value) {
    const auto list = writeXMLPropertyList(value);
    return list ? *list : std::string();
}

class HonestyTest : public PartsFixture {
protected:
    HonestyTest() : PartsFixture() {
        mock.put(Mock::simPath(0), {{Mock::sim,
                                     {{"SimIdentifier", "89111010000000000011"},
                                      {"Imsi", "001011111111111"},
                                      {"OperatorName", "Elder SIM"}}}});
        mock.put(
            Mock::bearerPath(111),
            {{Mock::bearer,
              {{"Connected", true},
               {"Interface", "elder111"},
               {"Ip4Config", QVariantMap{{"method", 2U}, {"address", "192.0.2.111"}}},
               {"Stats", QVariantMap{{"rx-bytes", qulonglong(1110)}, {"tx-bytes", qulonglong(1111)}}}}}});
        InterfaceMap modem = testModem(lteAccess, {{"Manufacturer", "Elder"},
                                                   {"EquipmentIdentifier", "004999111111111"},
                                                   {"OwnNumbers", QStringList("+111")},
                                                   {"Bearers", paths({Mock::bearerPath(111)})}});
        modem[Mock::modem3gpp]["OperatorName"] = "Elder Network";
        modem[Mock::location] = {{"Enabled", 1U << 1 | 1U}};
        modem[Mock::signal] = {{"Rate", 5U}, {"Lte", QVariantMap{{"rssi", -11.1}}}};
        mock.put(Mock::modemPath(0), modem);
        setCells({{{"cell-type", 5U}, {"serving", true}, {"tac", "111"}, {"earfcn", 1111U}, {"rsrp", -111.0}},
                  {{"cell-type", 5U}, {"serving", false}, {"physical-ci", "111"}, {"earfcn", 1110U}}});
        mock.answers["GetLocation"] = {
            {QVariant::fromValue(LocationMap{
                {1U, QDBusVariant(QString("111,11,0000,111,111"))},
                {2U,
                 QDBusVariant(QVariantMap{{"latitude", 11.1}, {"longitude", 11.1}, {"altitude", 111.0}})}})},
            {},
            {}};
        follow();
        listen();
        EXPECT_EQ(at(cells(), {"0", "kVoxCellMonitorEARFCN"}), Value(1111));
        EXPECT_TRUE(becomes(LiveModemCode::sim, {"kVoxSIMOperatorName"}, "Elder SIM"));
        EXPECT_TRUE(becomes(LiveModemCode::position, {"kVoxPositionLatitude"}, 11.1));
        EXPECT_TRUE(becomes(LiveModemCode::traffic, {"kVoxTraffic", "0", "kVoxTrafficSent"}, 1111));
    }

    /// What the latest message of the code says, as text.
    std::string text(std::uint32_t code) const { return textOf(latest(code)); }
    /// What the sections that show it make of all messages so far, as text.
    std::string shown(std::uint32_t code) const {
        FakeResources resources;
        resources.put("Modem", "plist", shippedResource("Modem.plist"));
        const auto decoder = LogGenerator::generatorFromTechnology(kVoxLogChannelTechnology_Modem, clock);
        Dictionary state;
        for (const Data& message : sink.messages) {
            decoder->updateState(state, message);
            static_cast<void>(decoder->display(state));
        }
        std::string words;
        const Dictionary* const display = state["Display"].asDictionary();
        for (const char* const section : sections.at(code))
            words += display ? textOf((*display)[section]) : std::string();
        return words;
    }
    void expectNothingOld(std::initializer_list<std::uint32_t> codes) const {
        for (const std::uint32_t code : codes) {
            EXPECT_FALSE(hasMark(text(code))) << std::hex << code << ": " << text(code);
            EXPECT_FALSE(hasMark(shown(code))) << std::hex << code << ": " << shown(code);
            EXPECT_NE(shown(code).find("<key>State</key>"), std::string::npos) << std::hex << code;
        }
    }
    static constexpr std::initializer_list<std::uint32_t> all = {
        LiveModemCode::sim,  LiveModemCode::cells,   LiveModemCode::contexts, LiveModemCode::registration,
        LiveModemCode::link, LiveModemCode::traffic, LiveModemCode::modem,    LiveModemCode::position};
};

TEST_F(HonestyTest, theMarksAreThere) {
    for (const std::uint32_t code : all) {
        EXPECT_TRUE(hasMark(text(code))) << std::hex << code << ": " << text(code);
        EXPECT_TRUE(hasMark(shown(code))) << std::hex << code << ": " << shown(code);
    }
}

TEST_F(HonestyTest, coverageIsLost) {
    setCells({});
    mock.answers["GetLocation"] = {{QVariant::fromValue(LocationMap())}, {}, {}};
    mock.change(Mock::modemPath(0), Mock::modem,
                {{"AccessTechnologies", 0U}, {"State", 7}, {"Bearers", paths({})}});
    mock.change(Mock::modemPath(0), Mock::modem3gpp,
                {{"RegistrationState", 2U}, {"OperatorCode", ""}, {"OperatorName", ""}});
    mock.change(Mock::modemPath(0), Mock::signal, {{"Lte", QVariantMap()}});
    drain();
    queue.advance(3s);
    drain();
    queue.advance(1s);
    expectNothingOld({LiveModemCode::cells, LiveModemCode::contexts, LiveModemCode::registration,
                      LiveModemCode::link, LiveModemCode::traffic, LiveModemCode::position});
    EXPECT_EQ(latest(LiveModemCode::cells, {"kVoxCellMonitorCells"}), array({}));
    EXPECT_EQ(latest(LiveModemCode::registration),
              dictionary({{"kVoxModemPresence", 0}, {"kVoxModemState", 7}, {"kVoxRegistrationState", 2}}));
}

TEST_F(HonestyTest, theModemGoesToStandaloneNR) {
    setCells({{{"cell-type", 6U}, {"serving", true}, {"tac", "10005"}, {"nrarfcn", 431000U}}});
    mock.change(Mock::modemPath(0), Mock::modem, {{"AccessTechnologies", nrAccess}});
    mock.change(Mock::modemPath(0), Mock::signal,
                {{"Lte", QVariantMap()}, {"Nr5g", QVariantMap{{"rsrp", -85.0}}}});
    drain();
    queue.advance(3s);
    drain();
    queue.advance(1s);
    EXPECT_EQ(latest(LiveModemCode::cells, {"kVoxCellMonitorCells"}),
              array({serving(kVoxCellMonitorRadioAccessTechnologyNR, {{"kVoxCellMonitorTAC", 65541},
                                                                      {"kVoxCellMonitorNRARFCN", 431000},
                                                                      {"kVoxCellMonitorRSRP", -85.0}})}));
    EXPECT_TRUE(latest(LiveModemCode::link, {"kVoxLinkLTE"}).isNone());
    expectNothingOld({LiveModemCode::cells, LiveModemCode::link});
}

TEST_F(HonestyTest, theModemIsUnplugged) {
    mock.remove(Mock::modemPath(0));
    drain();
    for (const std::uint32_t code : all)
        EXPECT_EQ(latest(code), dictionary({{"kVoxModemPresence", number(ModemPresence::NoModem)}}));
    expectNothingOld(all);
}

TEST_F(HonestyTest, anotherModemReplacesIt) {
    setCells({{{"cell-type", 2U}, {"serving", true}, {"arfcn", 62U}}});
    mock.answers["GetLocation"] = {{QVariant::fromValue(LocationMap())}, {}, {}};
    mock.put(Mock::simPath(2), {{Mock::sim, {{"SimIdentifier", "89011010000000000025"}}}});
    mock.put(Mock::modemPath(2),
             testModem(gsmAccess, {{"Sim", QVariant::fromValue(QDBusObjectPath(Mock::simPath(2)))}}));
    mock.remove(Mock::modemPath(0));
    drain();
    queue.advance(1s);
    drain();
    queue.advance(1s);
    expectNothingOld(all);
    EXPECT_EQ(latest(LiveModemCode::cells, {"kVoxCellMonitorCells", "0", "kVoxCellMonitorARFCN"}), Value(62));
    EXPECT_EQ(latest(LiveModemCode::sim, {"kSimFile_ICCID"}), Value("89011010000000000025"));
}

TEST_F(HonestyTest, anotherSIMReplacesTheSIM) {
    mock.put(Mock::simPath(2), {{Mock::sim, {{"SimIdentifier", "89011010000000000025"}}}});
    mock.held = "GetCellInfo"; // the modem is busy with its new SIM
    mock.change(Mock::modemPath(0), Mock::modem,
                {{"Sim", QVariant::fromValue(QDBusObjectPath(Mock::simPath(2)))},
                 {"OwnNumbers", QStringList()},
                 {"Bearers", paths({})}});
    drain();
    queue.advance(1s);
    drain();
    queue.advance(1s);
    expectNothingOld({LiveModemCode::sim, LiveModemCode::contexts, LiveModemCode::traffic});
    const Value cells = latest(LiveModemCode::cells, {"kVoxModemCellReport"});
    EXPECT_EQ(cells, number(ModemCellReport::NotYet)) << text(LiveModemCode::cells);
    EXPECT_EQ(latest(LiveModemCode::sim, {"kSimFile_ICCID"}), Value("89011010000000000025"));
}

TEST_F(HonestyTest, cellsThatCannotBeReportedAnyMoreAreGone) {
    mock.answers["GetCellInfo"] = {{}, "org.freedesktop.DBus.Error.NoReply", "no reply"};
    queue.advance(3s);
    EXPECT_TRUE(becomes(LiveModemCode::cells, {"kVoxModemCellReport"}, number(ModemCellReport::Failing)));
    EXPECT_EQ(text(LiveModemCode::cells).find("<integer>1111</integer>"), std::string::npos);
    EXPECT_EQ(latest(LiveModemCode::cells, {"kVoxModemReason"}),
              Value("org.freedesktop.DBus.Error.NoReply: no reply"));
}

} // namespace
} // namespace velmora

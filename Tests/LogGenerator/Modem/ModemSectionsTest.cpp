// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/Modem/ModemFixture.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

class ModemSectionsTest : public ModemFixture {
protected:
    /// The section's node after a message of a registered modem with these entries, without the state.
    std::string nodeOf(std::string_view section, std::uint32_t code,
                       std::initializer_list<Dictionary::Entry> entries) {
        const DictionaryRef message = makeDictionary();
        message->set("kVoxModemState", 8);
        for (const Dictionary::Entry& entry : entries)
            message->set(entry.key, entry.value);
        return after(section, {modemMessage(code, message)});
    }
};

TEST_F(ModemSectionsTest, Link) {
    const Value lte = dictionary({{"kVoxLinkRSSI", -60.5},
                                  {"kVoxLinkRSRQ", -12},
                                  {"kVoxLinkRSRP", -90},
                                  {"kVoxLinkSINR", 9.75},
                                  {"kVoxLinkErrorRate", 0.5},
                                  {"kVoxLinkRSCP", -80}}); // which LTE has not
    EXPECT_EQ(nodeOf("Link", LiveModemCode::link,
                     {{"kVoxLinkAccessTechnologies", 0xC000},
                      {"kVoxLinkSignalQuality", 71},
                      {"kVoxLinkIsRecent", true},
                      {"kVoxLinkLTE", lte},
                      {"kVoxLinkNR", dictionary({{"kVoxLinkRSRP", -99}, {"kVoxLinkRSRQ", 5000}})},
                      {"kVoxLinkUMTS", "text"}}),
              "{State 'Registered', Access Technologies 'LTE, 5G NR', Signal Quality '71%', "
              "Signal Quality Is Recent 'Yes', NR RSRP '-99.0 dBm', LTE RSRP '-90.0 dBm', "
              "LTE RSRQ '-12.0 dB', LTE SINR '9.8 dB', LTE RSSI '-60.5 dBm', LTE Error Rate '0.50%'}");
}

TEST_F(ModemSectionsTest, LinkOfOlderTechnologies) {
    const auto levels = [] {
        return dictionary({{"kVoxLinkRSSI", -80},
                           {"kVoxLinkRSCP", -85},
                           {"kVoxLinkECIO", -6.5},
                           {"kVoxLinkSINR", 4},
                           {"kVoxLinkIO", -83},
                           {"kVoxLinkErrorRate", 1}});
    };
    EXPECT_EQ(nodeOf("Link", LiveModemCode::link,
                     {{"kVoxLinkAccessTechnologies", std::int64_t{0x80000022}},
                      {"kVoxLinkSignalQuality", 101},
                      {"kVoxLinkGSM", levels()},
                      {"kVoxLinkUMTS", levels()},
                      {"kVoxLinkCDMA", levels()},
                      {"kVoxLinkEVDO", levels()}}),
              "{State 'Registered', Access Technologies 'GSM, UMTS, 0x80000000', UMTS RSSI '-80.0 dBm', "
              "UMTS RSCP '-85.0 dBm', UMTS Ec-Io '-6.5 dB', UMTS Error Rate '1.00%', GSM RSSI '-80.0 dBm', "
              "GSM Error Rate '1.00%', CDMA RSSI '-80.0 dBm', CDMA Ec-Io '-6.5 dB', CDMA Error Rate '1.00%', "
              "EV-DO RSSI '-80.0 dBm', EV-DO Ec-Io '-6.5 dB', EV-DO SINR '4.0 dB', EV-DO Io '-83.0 dBm', "
              "EV-DO Error Rate '1.00%'}");
}

TEST_F(ModemSectionsTest, Registration) {
    EXPECT_EQ(nodeOf("Registration", LiveModemCode::registration,
                     {{"kVoxRegistrationState", 5},
                      {"kVoxRegistrationPLMN", "310260"},
                      {"kVoxRegistrationOperator", "Test"},
                      {"kVoxRegistrationPacketService", 2}}),
              "{State 'Registered', Registration State 'Registered, roaming', Roaming 'Yes', "
              "PLMN '310-260', Operator 'Test', Packet Service 'Attached'}");
    EXPECT_EQ(nodeOf("Registration", LiveModemCode::registration,
                     {{"kVoxRegistrationState", 1}, {"kVoxRegistrationPLMN", "00101"}}),
              "{State 'Registered', Registration State 'Registered, home', Roaming 'No', PLMN '001-01'}");
    // Neither at home nor abroad; a text that is no network.
    EXPECT_EQ(nodeOf("Registration", LiveModemCode::registration,
                     {{"kVoxRegistrationState", 3},
                      {"kVoxRegistrationPLMN", "0010"},
                      {"kVoxRegistrationPacketService", 0}}),
              "{State 'Registered', Registration State 'Denied'}");
    EXPECT_EQ(nodeOf("Registration", LiveModemCode::registration,
                     {{"kVoxRegistrationCDMA1x", 3},
                      {"kVoxRegistrationEVDO", 9},
                      {"kVoxRegistrationSID", 16420},
                      {"kVoxRegistrationNID", 65535}}),
              "{State 'Registered', CDMA 1x Registration 'Registered, roaming', EV-DO Registration "
              "'Unknown (9)', SID '16420', NID '65535'}");
}

struct RoamingCase {
    int registration;
    const char* roaming;
};
class RoamingTest : public ModemSectionsTest, public testing::WithParamInterface<RoamingCase> {};

TEST_P(RoamingTest, FollowsFromTheRegistration) {
    nodeOf("Registration", LiveModemCode::registration, {{"kVoxRegistrationState", GetParam().registration}});
    EXPECT_EQ(text("Registration", "Roaming"), GetParam().roaming);
}
INSTANTIATE_TEST_SUITE_P(States, RoamingTest,
                         testing::Values(RoamingCase{0, "(none)"}, RoamingCase{1, "No"},
                                         RoamingCase{2, "(none)"}, RoamingCase{4, "(none)"},
                                         RoamingCase{5, "Yes"}, RoamingCase{6, "No"}, RoamingCase{7, "Yes"},
                                         RoamingCase{8, "(none)"}, RoamingCase{9, "No"},
                                         RoamingCase{10, "Yes"}, RoamingCase{11, "(none)"}));

TEST_F(ModemSectionsTest, PacketDataContexts) {
    const Value ipv4 = dictionary({{"kVoxContextMethod", 2},
                                   {"kVoxContextAddress", "10.0.0.2"},
                                   {"kVoxContextPrefix", 30},
                                   {"kVoxContextGateway", "10.0.0.1"},
                                   {"kVoxContextDNS", list({"9.9.9.9", 7, "1.1.1.1"})},
                                   {"kVoxContextMTU", 1430}});
    const Value ipv6 = dictionary(
        {{"kVoxContextMethod", 3}, {"kVoxContextAddress", "2001:db8::2"}, {"kVoxContextPrefix", 64}});
    const Value first = dictionary({{"kVoxContextBearer", 1},
                                    {"kVoxContextIsConnected", true},
                                    {"kVoxContextIsSuspended", false},
                                    {"kVoxContextType", 1},
                                    {"kVoxContextProfile", 3},
                                    {"kVoxContextAPN", "internet"},
                                    {"kVoxContextIPFamily", 4},
                                    {"kVoxContextInterface", "wwan0"},
                                    {"kVoxContextUplinkSpeed", 50'000'000},
                                    {"kVoxContextDownlinkSpeed", 150'000'000},
                                    // 1000000000 s after 1970: 2001-09-09 01:46:40
                                    {"kVoxContextStart", Date(std::chrono::seconds(1'000'000'000))},
                                    {"kVoxContextIPv4", ipv4},
                                    {"kVoxContextIPv6", ipv6}});
    const Value second = dictionary({{"kVoxContextBearer", 2},
                                     {"kVoxContextIsConnected", false},
                                     {"kVoxContextError", "operation not allowed"},
                                     {"kVoxContextIPFamily", 3}});
    EXPECT_EQ(
        nodeOf("Packet Data Contexts", LiveModemCode::contexts, {{"kVoxContexts", list({first, second})}}),
        "{State 'Registered', Contexts [{Bearer '1', Connected 'Yes', Suspended 'No', Type 'Default', "
        "Profile '3', APN 'internet', IP Family 'IPv4v6', Interface 'wwan0', "
        "Downlink Speed '150000 kbit/s', Uplink Speed '50000 kbit/s', "
        "Since (UTC) '2001-09-09 01:46:40', IPv4 Method 'Static', IPv4 Address '10.0.0.2', "
        "IPv4 Prefix '30', IPv4 Gateway '10.0.0.1', IPv4 DNS '9.9.9.9, 1.1.1.1', "
        "IPv4 MTU '1430 bytes', IPv6 Method 'DHCP', IPv6 Address '2001:db8::2', IPv6 Prefix '64'}, "
        "{Bearer '2', Connected 'No', Error 'operation not allowed', IP Family 'IPv4, IPv6'}]}");
    EXPECT_EQ(nodeOf("Packet Data Contexts", LiveModemCode::contexts, {}), "{State 'None', Contexts []}");
}

TEST_F(ModemSectionsTest, Traffic) {
    const Value bearer = dictionary({{"kVoxTrafficBearer", 0},
                                     {"kVoxTrafficInterface", "wwan0"},
                                     {"kVoxTrafficReceived", std::int64_t{5'000'000'000}},
                                     {"kVoxTrafficSent", 2147483647},
                                     {"kVoxTrafficDuration", 3600},
                                     {"kVoxTrafficDownlinkRate", 1'234'567.0},
                                     {"kVoxTrafficUplinkRate", 0.0},
                                     {"kVoxTrafficInterval", 5.02}});
    EXPECT_EQ(nodeOf("Traffic", LiveModemCode::traffic,
                     {{"kVoxTraffic", list({bearer, dictionary({{"kVoxTrafficSent", -1}})})}}),
              "{State 'Registered', Bearers [{Bearer '0', Interface 'wwan0', Downlink Rate '1234.6 kbit/s', "
              "Uplink Rate '0.0 kbit/s', Rates Are Over '5.0 s', Received '5000000000 bytes', "
              "Sent '2147483647 bytes', Duration '3600 s'}, {}]}");
    EXPECT_EQ(nodeOf("Traffic", LiveModemCode::traffic, {{"kVoxTraffic", 3}}), "{State 'None', Bearers []}");
}

TEST_F(ModemSectionsTest, SIM) {
    EXPECT_EQ(nodeOf("SIM", LiveModemCode::sim,
                     {{"kSimFile_ICCID", "89010000000000000011"},
                      {"kSimFile_MSISDN", list({"+1234", "+5678"})},
                      {"kVoxSIMIMSI", "001010123456789"},
                      {"kVoxSIMEID", "89033023"},
                      {"kVoxSIMOperatorCode", "00101"},
                      {"kVoxSIMOperatorName", "Test"},
                      {"kVoxSIMGroup1", Data(std::vector<std::uint8_t>{0x0A, 0xFF})},
                      {"kVoxSIMGroup2", Data(std::vector<std::uint8_t>{})},
                      {"kVoxSIMEmergencyNumbers", list({"112", "911"})},
                      {"kVoxSIMPreferredNetworks", list({dictionary({{"kVoxSIMOperatorCode", "310260"},
                                                                     {"kVoxLinkAccessTechnologies", 0x4002}}),
                                                         dictionary({{"kVoxSIMOperatorCode", "x"}})})},
                      {"kVoxSIMType", 2}}),
              "{State 'Registered', Type 'eSIM', ICCID '89010000000000000011', IMSI '001010123456789', "
              "MSISDN '+1234, +5678', EID '89033023', Operator PLMN '001-01', Operator 'Test', GID1 '0AFF', "
              "Emergency Numbers '112, 911', Preferred Networks [{PLMN '310-260', "
              "Access Technologies 'GSM, LTE'}, {}]}");
    EXPECT_EQ(sectionNode("SIM Slots"), "{State 'One slot', Slots []}");
}

TEST_F(ModemSectionsTest, SIMSlots) {
    EXPECT_EQ(nodeOf("SIM Slots", LiveModemCode::sim,
                     {{"kVoxSIMSlots", list({dictionary({{"kVoxSIMSlotNumber", 1},
                                                         {"kVoxSIMSlotIsActive", true},
                                                         {"kVoxSIMSlotHasSIM", true},
                                                         {"kSimFile_ICCID", "8901"},
                                                         {"kVoxSIMOperatorName", "Test"},
                                                         {"kVoxSIMOperatorCode", "00101"}}),
                                             dictionary({{"kVoxSIMSlotNumber", 2},
                                                         {"kVoxSIMSlotIsActive", false},
                                                         {"kVoxSIMSlotHasSIM", false}})})}}),
              "{State 'Registered', Slots [{Slot '1', Active 'Yes', SIM 'Present', ICCID '8901', "
              "Operator 'Test', Operator PLMN '001-01'}, {Slot '2', Active 'No', SIM 'Absent'}]}");
}

TEST_F(ModemSectionsTest, Modem) {
    EXPECT_EQ(nodeOf("Modem", LiveModemCode::modem,
                     {{"kVoxModemIndex", 0},
                      {"kVoxModemState", -1},
                      {"kVoxModemFailedReason", 3},
                      {"kVoxModemLock", 4},
                      {"kVoxModemManufacturer", "Maker"},
                      {"kVoxModemModel", "M1"},
                      {"kVoxModemRevision", "1.0"},
                      {"kVoxModemHardware", "A"},
                      {"kVoxModemEquipment", "004400152020000"},
                      {"kVoxModemDevice", "/sys/devices/x"},
                      {"kVoxModemPlugin", "generic"},
                      {"kVoxModemPort", "cdc-wdm0"},
                      {"kVoxModemDrivers", list({"qmi_wwan", "option"})},
                      {"kVoxModemPowerState", 3},
                      {"kVoxModemCapabilities", 0x4C},
                      {"kVoxModemManagerVersion", "1.20.4"}}),
              "{State 'Failed: SIM error', Manufacturer 'Maker', Model 'M1', Revision '1.0', "
              "Hardware Revision 'A', Equipment ID '004400152020000', Modem State 'Failed', "
              "Failure 'SIM error', Lock 'SIM PUK', Power State 'On', "
              "Capabilities 'GSM/UMTS, LTE, 5G NR', Drivers 'qmi_wwan, option', Plugin 'generic', "
              "Primary Port 'cdc-wdm0', Device '/sys/devices/x', Index '0', ModemManager Version '1.20.4'}");
}

TEST_F(ModemSectionsTest, Position) {
    EXPECT_EQ(nodeOf("Position", LiveModemCode::position,
                     {{"kVoxPositionLatitude", -33.5},
                      {"kVoxPositionLongitude", 151.25},
                      {"kVoxPositionAltitude", 12},
                      {"kVoxPositionTime", "101500.00"}}),
              "{State 'Registered', Latitude '-33.500000\u00B0', Longitude '151.250000\u00B0', "
              "Altitude '12.0 m', Time (UTC) '10:15:00.00'}");
    EXPECT_EQ(nodeOf("Position", LiveModemCode::position, {{"kVoxPositionLatitude", 90.5}}),
              "{State 'No position'}");
}

} // namespace
} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/PartsFixture.h"

#include <limits>

/// Registration, link and the modem itself, from the bus to the messages.

namespace velmora {
namespace {

using LinkTest = PartsFixture;

TEST_F(LinkTest, everyLevelIsThereByTechnology) {
    const auto error = std::pair<QString, QVariant>("error-rate", 0.5);
    putModem(lteAccess | nrAccess,
             {{"Rate", 1U},
              {"Gsm", QVariantMap{{"rssi", -70.0}, error}},
              {"Umts", QVariantMap{{"rssi", -71.0}, {"rscp", -80.5}, {"ecio", -5.5}, error}},
              {"Lte", QVariantMap{{"rssi", -62.0}, {"rsrp", -95.25}, {"rsrq", -10.5}, {"snr", 13.04}, error}},
              {"Nr5g", QVariantMap{{"rsrp", -85.0}, {"rsrq", -11.0}, {"snr", -1.5}, error}},
              {"Cdma", QVariantMap{{"rssi", -72.0}, {"ecio", -6.0}, error}},
              {"Evdo", QVariantMap{{"rssi", -73.0}, {"ecio", -7.0}, {"sinr", 9.0}, {"io", -90.0}, error}}});
    follow();
    listen();
    EXPECT_TRUE(becomes(
        LiveModemCode::link, {},
        root({{"kVoxLinkAccessTechnologies", 1 << 14 | 1 << 15},
              {"kVoxLinkSignalQuality", 60},
              {"kVoxLinkIsRecent", true},
              {"kVoxLinkGSM", dictionary({{"kVoxLinkRSSI", -70.0}, {"kVoxLinkErrorRate", 0.5}})},
              {"kVoxLinkUMTS", dictionary({{"kVoxLinkRSSI", -71.0},
                                           {"kVoxLinkRSCP", -80.5},
                                           {"kVoxLinkECIO", -5.5},
                                           {"kVoxLinkErrorRate", 0.5}})},
              {"kVoxLinkLTE", dictionary({{"kVoxLinkRSSI", -62.0},
                                          {"kVoxLinkRSRP", -95.25},
                                          {"kVoxLinkRSRQ", -10.5},
                                          {"kVoxLinkSINR", 13.04},
                                          {"kVoxLinkErrorRate", 0.5}})},
              {"kVoxLinkNR", dictionary({{"kVoxLinkRSRP", -85.0},
                                         {"kVoxLinkRSRQ", -11.0},
                                         {"kVoxLinkSINR", -1.5},
                                         {"kVoxLinkErrorRate", 0.5}})},
              {"kVoxLinkCDMA",
               dictionary({{"kVoxLinkRSSI", -72.0}, {"kVoxLinkECIO", -6.0}, {"kVoxLinkErrorRate", 0.5}})},
              {"kVoxLinkEVDO", dictionary({{"kVoxLinkRSSI", -73.0},
                                           {"kVoxLinkECIO", -7.0},
                                           {"kVoxLinkSINR", 9.0},
                                           {"kVoxLinkIO", -90.0},
                                           {"kVoxLinkErrorRate", 0.5}})}})));

    // Levels change often; they are reported together.
    const std::size_t before = count(LiveModemCode::link);
    for (int i = 0; i < 50; ++i)
        mock.change(Mock::modemPath(0), Mock::signal,
                    {{"Lte", QVariantMap{{"rsrp", -100.0 - i},
                                         {"rsrq", std::numeric_limits<double>::quiet_NaN()},
                                         {"snr", -9999.0},
                                         {"rssi", 5U}}},
                     {"Nr5g", QVariantMap()}});
    drain();
    queue.advance(std::chrono::milliseconds(100));
    EXPECT_EQ(count(LiveModemCode::link), before + 1);
    EXPECT_EQ(latest(LiveModemCode::link, {"kVoxLinkLTE"}), dictionary({{"kVoxLinkRSRP", -149.0}}));
    EXPECT_TRUE(latest(LiveModemCode::link, {"kVoxLinkNR"}).isNone());
    mock.removeInterface(Mock::modemPath(0), Mock::signal);
    EXPECT_TRUE(becomes(LiveModemCode::link, {"kVoxLinkGSM"}, {}));
}

TEST_F(LinkTest, registrationOf3GPPAndOfCDMA) {
    InterfaceMap modem = testModem(lteAccess);
    modem[Mock::modem3gpp]["PacketServiceState"] = 2U;
    modem[Mock::modem3gpp]["RegistrationState"] = 5U;
    modem[Mock::modem3gpp]["OperatorCode"] = "310026";
    modem[Mock::modemCdma] = {
        {"Cdma1xRegistrationState", 3U}, {"EvdoRegistrationState", 0U}, {"Sid", 1234U}, {"Nid", 99999U}};
    mock.put(Mock::modemPath(0), modem);
    follow();
    listen();
    EXPECT_TRUE(becomes(LiveModemCode::registration, {},
                        root({{"kVoxRegistrationState", 5},
                              {"kVoxRegistrationPLMN", "310026"},
                              {"kVoxRegistrationOperator", "Test Network"},
                              {"kVoxRegistrationPacketService", 2},
                              {"kVoxRegistrationCDMA1x", 3},
                              {"kVoxRegistrationSID", 1234}})));
    mock.change(
        Mock::modemPath(0), Mock::modem3gpp,
        {{"RegistrationState", 2U}, {"OperatorCode", ""}, {"OperatorName", ""}, {"PacketServiceState", 0U}});
    mock.removeInterface(Mock::modemPath(0), Mock::modemCdma);
    EXPECT_TRUE(becomes(LiveModemCode::registration, {}, root({{"kVoxRegistrationState", 2}})));
}

TEST_F(LinkTest, theModemItself) {
    mock.put(Mock::managerPath, {{Mock::manager, {{"Version", "1.20.4"}}}});
    mock.put(Mock::modemPath(4), testModem(lteAccess, {{"Revision", "R1.2"},
                                                       {"HardwareRevision", "H3"},
                                                       {"EquipmentIdentifier", "004999010640000"},
                                                       {"Device", "/sys/devices/usb1"},
                                                       {"Plugin", "generic"},
                                                       {"PrimaryPort", "cdc-wdm0"},
                                                       {"Drivers", QStringList{"qmi_wwan", "option"}},
                                                       {"PowerState", 3U}}));
    follow();
    listen();
    EXPECT_TRUE(becomes(LiveModemCode::modem, {},
                        root({{"kVoxModemIndex", 4},
                              {"kVoxModemManufacturer", "Test"},
                              {"kVoxModemModel", "Modem"},
                              {"kVoxModemRevision", "R1.2"},
                              {"kVoxModemHardware", "H3"},
                              {"kVoxModemEquipment", "004999010640000"},
                              {"kVoxModemDevice", "/sys/devices/usb1"},
                              {"kVoxModemPlugin", "generic"},
                              {"kVoxModemPort", "cdc-wdm0"},
                              {"kVoxModemDrivers", array({"qmi_wwan", "option"})},
                              {"kVoxModemPowerState", 3},
                              {"kVoxModemCapabilities", 1 << 2 | 1 << 3},
                              {"kVoxModemManagerVersion", "1.20.4"}})));
}

TEST_F(LinkTest, membersOfOtherTypesAreLeftOut) {
    putModemWith({{"State", "8"},
                  {"SignalQuality", QVariant::fromValue(Quality{101, true})},
                  {"AccessTechnologies", -5},
                  {"Manufacturer", "\x07"},
                  {"EquipmentIdentifier", 5U},
                  {"Drivers", 5U}});
    mock.change(Mock::modemPath(0), Mock::modem3gpp,
                {{"RegistrationState", -1.0}, {"OperatorCode", "1"}, {"OperatorName", "\x07"}});
    follow();
    listen();
    EXPECT_TRUE(becomes(LiveModemCode::link, {}, dictionary({{"kVoxModemPresence", 0}})));
    EXPECT_EQ(latest(LiveModemCode::registration), dictionary({{"kVoxModemPresence", 0}}));
    EXPECT_TRUE(latest(LiveModemCode::modem, {"kVoxModemManufacturer"}).isNone());
}

} // namespace
} // namespace velmora

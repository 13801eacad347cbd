// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/ModemChoice.h"

#include "Tests/Telephony/ModemManager/PartsFixture.h"

/// Which of several modems is followed.

namespace velmora {
namespace {

using ::testing::Contains;
using ::testing::ElementsAre;

class ModemChoiceTest : public PartsFixture {
protected:
    static InterfaceMap modemOf(const QString& equipment, const QString& device = "/sys/devices/x",
                                int sim = 0) {
        return testModem(lteAccess, {{"EquipmentIdentifier", equipment},
                                     {"Device", device},
                                     {"Sim", QVariant::fromValue(QDBusObjectPath(Mock::simPath(sim)))}});
    }
    static ModemChoice modem(std::string_view text) {
        ModemChoice choice;
        EXPECT_TRUE(choice.setModem(text)) << text;
        return choice;
    }
    static ModemChoice sim(std::string_view text) {
        ModemChoice choice;
        EXPECT_TRUE(choice.setSIM(text)) << text;
        return choice;
    }
    [[nodiscard]] bool followsIndex(int index) {
        return becomes(LiveModemCode::modem, {"kVoxModemIndex"}, index);
    }
    [[nodiscard]] bool followsNone() {
        return becomes(LiveModemCode::modem, {"kVoxModemPresence"}, number(ModemPresence::NotTheOne));
    }
};

TEST_F(ModemChoiceTest, byIndex) {
    mock.put(Mock::modemPath(0), modemOf("004999010640000"));
    mock.put(Mock::modemPath(2), modemOf("004999010640002"));
    follow(modem("7"));
    EXPECT_THAT(warnings(), ElementsAre("modemmanager: no modem 7 is there, only: 0, 2"));
    listen();
    ASSERT_TRUE(followsNone());
    mock.put(Mock::modemPath(7), modemOf("004999010640007"));
    ASSERT_TRUE(followsIndex(7));
}

TEST_F(ModemChoiceTest, theModemOfAnIndexIsFollowedUnderAnotherOne) {
    mock.put(Mock::modemPath(0), modemOf("004999010640000"));
    mock.put(Mock::modemPath(1), modemOf("004999010640001"));
    follow(modem("1"));
    listen();
    ASSERT_TRUE(followsIndex(1));
    mock.remove(Mock::modemPath(1));
    ASSERT_TRUE(followsNone());
    mock.put(Mock::modemPath(5), modemOf("004999010640001"));
    ASSERT_TRUE(followsIndex(5));
    // ModemManager starts again, and counts from 0.
    mock.vanish();
    ASSERT_TRUE(becomes(LiveModemCode::modem, {"kVoxModemPresence"}, number(ModemPresence::NoManager)));
    mock.put(Mock::modemPath(0), modemOf("004999010640001"));
    mock.put(Mock::modemPath(1), modemOf("004999010640000"));
    mock.appear();
    ASSERT_TRUE(followsIndex(0));
}

TEST_F(ModemChoiceTest, byEquipmentIdentity) {
    mock.put(Mock::modemPath(0), modemOf("004999010640000"));
    mock.put(Mock::modemPath(1), modemOf("a10000009296f2"));
    follow(modem("A10000009296F2"));
    listen();
    ASSERT_TRUE(followsIndex(1));
    mock.remove(Mock::modemPath(1));
    ASSERT_TRUE(followsNone());
    EXPECT_THAT(warnings(), Contains("modemmanager: no modem with the chosen identity is there, only: 0"));
    mock.put(Mock::modemPath(9), modemOf("A10000009296F2"));
    ASSERT_TRUE(followsIndex(9));
}

TEST_F(ModemChoiceTest, byThePathOfTheDeviceOrOfTheObject) {
    mock.put(Mock::modemPath(0), modemOf("004999010640000", "/sys/devices/usb1"));
    mock.put(Mock::modemPath(1), modemOf("004999010640001", "/sys/devices/usb2"));
    follow(modem("/sys/devices/usb2"));
    listen();
    ASSERT_TRUE(followsIndex(1));
    source->stop();
    follow(modem("/org/freedesktop/ModemManager1/Modem/0"));
    listen();
    ASSERT_TRUE(followsIndex(0));
}

TEST_F(ModemChoiceTest, bySIM) {
    mock.put(Mock::simPath(1), {{Mock::sim, {{"SimIdentifier", "89011010000000000025"}}}});
    mock.put(Mock::modemPath(0), modemOf("004999010640000"));
    mock.put(Mock::modemPath(1), modemOf("004999010640001", "/sys/devices/y", 1));
    follow(sim("8901101000000000002F")); // a shorter one, with a filler
    listen();
    ASSERT_TRUE(followsNone());
    EXPECT_THAT(warnings(), Contains("modemmanager: no modem with the chosen SIM is there, only: 0, 1"));
    source->stop();
    follow(sim("89011010000000000025"));
    listen();
    ASSERT_TRUE(followsIndex(1));
    // The card moves to the other modem, whose SIM is another object then.
    mock.remove(Mock::modemPath(1));
    ASSERT_TRUE(followsNone());
    mock.put(Mock::simPath(8), {{Mock::sim, {{"SimIdentifier", "89011010000000000025"}}}});
    mock.change(Mock::modemPath(0), Mock::modem,
                {{"Sim", QVariant::fromValue(QDBusObjectPath(Mock::simPath(8)))}});
    ASSERT_TRUE(followsIndex(0));
    source->stop();
    follow(sim("/org/freedesktop/ModemManager1/SIM/8"));
    listen();
    ASSERT_TRUE(followsIndex(0));
}

TEST_F(ModemChoiceTest, aLockedSIMThatSaysWhoItIsLater) {
    mock.put(Mock::simPath(1), {{Mock::sim, {{"SimIdentifier", ""}}}});
    mock.put(Mock::modemPath(1), modemOf("004999010640001", "/sys/devices/y", 1));
    follow(sim("89011010000000000025"));
    listen();
    ASSERT_TRUE(followsNone());
    mock.change(Mock::simPath(1), Mock::sim, {{"SimIdentifier", "89011010000000000025"}});
    ASSERT_TRUE(followsIndex(1));
}

} // namespace
} // namespace velmora

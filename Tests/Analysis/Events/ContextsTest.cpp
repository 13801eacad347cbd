// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Analysis/Events/HandMade.h"

#include <gmock/gmock.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

struct Context {
    std::string_view key;
    std::string_view address;
};

constexpr std::string_view list = "/Packet Data/PDP Context Info";

HandMadeMessage contexts(HandMadeEngine& engine, double seconds, std::initializer_list<Context> all) {
    HandMadeMessage message = engine.at(seconds);
    message.list(list, static_cast<std::uint32_t>(all.size()));
    std::uint32_t row = 0;
    for (const Context& each : all)
        message.row(row++)
            .text("/Packet Data/PDP Context Info/*/Context ID", each.key)
            .text("/Packet Data/PDP Context Info/*/PDP Address", each.address);
    return message;
}

TEST(Contexts, GoUpAndDown) {
    HandMadeEngine lte{"Ostrel_LTE", {}};
    lte.send(contexts(lte, 0, {}));
    lte.send(contexts(lte, 1, {{"1", "192.0.2.17"}}));
    lte.send(contexts(lte, 2, {{"1", "192.0.2.17"}}));
    lte.send(contexts(lte, 3, {{"2", "2001:db8::17"}, {"1", "192.0.2.17"}}));
    lte.send(contexts(lte, 6, {{"2", "2001:db8::17"}}));
    EXPECT_THAT(lte.lines(), ElementsAre("1.000 context-up: context 1: 192.0.2.17",
                                         "3.000 context-up: context 2: 2001:db8::17",
                                         "6.000 context-down: context 1: 192.0.2.17"));
    EXPECT_EQ(textOf(lte.only("context-down"), "context"), "1");
    EXPECT_EQ(numberOf(lte.only("context-down"), "duration"), 5);
    EXPECT_THAT(lte.only("context-down").evidence, ElementsAre(MessageNumber{0, 2}, MessageNumber{0, 5}));
}

TEST(Contexts, ThatAreThereAtFirstAreNoEvents) {
    HandMadeEngine lte{"Ostrel_LTE", {}};
    lte.send(contexts(lte, 0, {{"1", "192.0.2.17"}}));
    EXPECT_THAT(lte.lines(), IsEmpty());
    lte.send(contexts(lte, 1, {}));
    EXPECT_EQ(lte.only("context-down").field("duration"), nullptr);
}

TEST(Contexts, AreNotReportedByMessagesOfOtherThings) {
    HandMadeEngine lte{"Ostrel_LTE", {}};
    lte.send(contexts(lte, 0, {{"1", "192.0.2.17"}}));
    lte.send(lte.at(1).list("/Idle Mode Neighbors/Neighbor Cells List", 0));
    EXPECT_THAT(lte.lines(), IsEmpty());
}

TEST(Contexts, MayHaveAnotherAddress) {
    HandMadeEngine lte{"Ostrel_LTE", {}};
    lte.send(contexts(lte, 0, {{"1", "192.0.2.17"}}));
    lte.send(contexts(lte, 1, {{"1", "192.0.2.18"}}));
    lte.send(contexts(lte, 2, {{"1", "192.0.2.18"}}));
    EXPECT_THAT(lte.lines(), ElementsAre("1.000 address-change: context 1: 192.0.2.17 to 192.0.2.18"));
    EXPECT_EQ(textOf(lte.only("address-change"), "from"), "192.0.2.17");
}

TEST(Contexts, OfALiveModemCountWhileTheyAreConnected) {
    HandMadeEngine modem{"Modem", {}};
    const auto bearer = [&modem](double seconds, bool isConnected) {
        modem.send(modem.at(seconds)
                       .list("/Packet Data Contexts/Contexts", 1)
                       .row(0)
                       .number("/Packet Data Contexts/Contexts/*/Bearer", 3)
                       .flag("/Packet Data Contexts/Contexts/*/Connected", isConnected));
    };
    bearer(0, false);
    bearer(1, true);
    bearer(2, false);
    EXPECT_THAT(modem.lines(), ElementsAre("1.000 context-up: context 3", "2.000 context-down: context 3"));
}

TEST(SIM, IsAnotherThanTheLastEvenIfThereWasNoneInBetween) {
    HandMadeEngine modem{"Modem", {}};
    modem.send(modem.at(0).text("/SIM/ICCID", "17"));
    modem.send(modem.at(1).text("/SIM/ICCID", "17"));
    modem.send(modem.at(2).removed("/SIM/ICCID"));
    modem.send(modem.at(3).text("/SIM/ICCID", "17"));
    modem.send(modem.at(4).text("/SIM/ICCID", "25"));
    EXPECT_THAT(modem.lines(), ElementsAre("4.000 sim-change: 17 to 25"));
    EXPECT_EQ(modem.only("sim-change").severity, Severity::Warning);
}

TEST(StoredArea, IsAnUpdateWhenItChanges) {
    HandMadeEngine lte{"Ostrel_LTE", {}};
    lte.send(lte.at(0).text("/SIM Info/EF-LOCI", "LAC 1"));
    lte.send(lte.at(1).text("/SIM Info/EF-LOCI", "LAC 1"));
    lte.send(lte.at(2).text("/SIM Info/EF-LOCI", "LAC 2"));
    EXPECT_THAT(lte.lines(), ElementsAre("2.000 area-update: location area update: LAC 1 to LAC 2"));
    EXPECT_EQ(textOf(lte.only("area-update"), "outcome"), "accepted");
}

} // namespace
} // namespace velmora

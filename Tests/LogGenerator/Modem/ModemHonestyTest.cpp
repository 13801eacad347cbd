// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Observations/Observation.h"
#include "Platform/TelephonyService.h"
#include "Tests/LogGenerator/Modem/ModemFixture.h"

#include <gtest/gtest.h>

#include <map>

// A value that the modem does not report any more is gone: from the display, and for a reader of
// observations.

namespace velmora {
namespace {

/// What a reader of the observations knows, by path.
class Reader final : public ObservationSink {
public:
    void observed(const ObservedMessage& message) override {
        for (const ObservedList& list : message.lists)
            std::erase_if(known, [prefix = list.list->path() + "/"](const auto& entry) {
                return entry.first.starts_with(prefix);
            });
        for (const CatalogueField* const leaf : message.removed)
            known.erase(leaf->path);
        for (const Observation& each : message.observations) {
            std::string path;
            each.appendPath(path);
            known[path] = _text.of(each);
        }
    }

    std::map<std::string, std::string> known;

private:
    ObservedText _text;
};

class ModemHonestyTest : public ModemFixture {
protected:
    ModemHonestyTest() {
        generator->setObservationSink(&reader);
        for (const Data& message : registered())
            update(message);
        expectReaderKnowsTheDisplay();
        EXPECT_TRUE(shows("12345678")) << "the test's own values";
    }
    ~ModemHonestyTest() override { generator->setObservationSink(nullptr); }

    /// All messages of a modem that is registered in LTE, with neighbours and a context.
    static std::vector<Data> registered() {
        const auto message = [](std::uint32_t code, std::initializer_list<Dictionary::Entry> entries) {
            const Value result = dictionary(entries);
            result.asDictionary()->set("kVoxModemPresence", 0);
            result.asDictionary()->set("kVoxModemState", 11);
            return modemMessage(code, result);
        };
        const Value lte = cell("LTE", "Serving",
                               {{"MCC", 1},
                                {"MNC", 1},
                                {"CellId", 12345678},
                                {"TAC", 1234},
                                {"PID", 321},
                                {"EARFCN", 1300},
                                {"RSRP", -91},
                                {"RSRQ", -9},
                                {"TimingAdvance", 7}});
        const Value nr = cell("NR", "Serving", {{"PID", 654}, {"NRARFCN", 630000}, {"RSRP", -93}});
        const Value neighbor = cell("LTE", "Neighbor", {{"PID", 322}, {"EARFCN", 1300}, {"RSRP", -97}});
        return {
            message(LiveModemCode::cells, {{"kVoxCellMonitorCells", list({lte, nr, neighbor, neighbor})}}),
            message(LiveModemCode::link, {{"kVoxLinkSignalQuality", 71},
                                          {"kVoxLinkLTE", dictionary({{"kVoxLinkRSRP", -91}})},
                                          {"kVoxLinkNR", dictionary({{"kVoxLinkRSRP", -93}})}}),
            message(LiveModemCode::registration,
                    {{"kVoxRegistrationState", 1}, {"kVoxRegistrationPLMN", "00101"}}),
            message(LiveModemCode::contexts,
                    {{"kVoxContexts",
                      list({dictionary({{"kVoxContextBearer", 1}, {"kVoxContextAPN", "internet"}})})}}),
            message(LiveModemCode::traffic,
                    {{"kVoxTraffic",
                      list({dictionary({{"kVoxTrafficBearer", 1}, {"kVoxTrafficReceived", 777777}})})}}),
            message(LiveModemCode::sim,
                    {{"kSimFile_ICCID", "8901111"},
                     {"kVoxSIMIMSI", "001011111"},
                     {"kSimFile_MSISDN", list({"+1111"})},
                     {"kVoxSIMOperatorName", "First"},
                     {"kVoxSIMSlots",
                      list({dictionary({{"kVoxSIMSlotNumber", 1}, {"kSimFile_ICCID", "8901111"}})})}}),
            message(LiveModemCode::modem,
                    {{"kVoxModemModel", "M1"}, {"kVoxModemEquipment", "004400152020000"}}),
            message(LiveModemCode::position, {{"kVoxPositionLatitude", 1.5}, {"kVoxPositionLongitude", 2.5}}),
        };
    }

    static void flatten(const Value& value, const std::string& path,
                        std::map<std::string, std::string>& leaves) {
        if (const std::string* const text = value.asString())
            leaves[path] = *text;
        if (const Dictionary* const dictionary = value.asDictionary())
            for (const auto& [key, child] : *dictionary)
                flatten(child, path + "/" + key, leaves);
        if (const Array* const array = value.asArray())
            for (std::size_t i = 0; i < array->size(); ++i)
                flatten((*array)[i], path + "/" + std::to_string(i), leaves);
    }
    void expectReaderKnowsTheDisplay() {
        std::map<std::string, std::string> leaves;
        flatten(generator->display(state), "", leaves);
        EXPECT_EQ(reader.known, leaves);
    }
    [[nodiscard]] bool shows(std::string_view text) { return display().find(text) != std::string::npos; }

    Reader reader;
};

TEST_F(ModemHonestyTest, CoverageLost) {
    update(modemMessage(LiveModemCode::cells, {{"kVoxModemState", 7}, {"kVoxModemNeighborReport", 0}}));
    update(modemMessage(LiveModemCode::link, {{"kVoxModemState", 7}, {"kVoxLinkSignalQuality", 0}}));
    update(modemMessage(LiveModemCode::registration, {{"kVoxModemState", 7}, {"kVoxRegistrationState", 2}}));
    expectReaderKnowsTheDisplay();
    EXPECT_EQ(sectionNode("Serving Cell"), "{State 'Searching, no serving cell'}");
    EXPECT_EQ(sectionNode("Secondary Cell"), "{State 'None'}");
    EXPECT_EQ(sectionNode("Neighbor Cells"), "{State 'None', Cells []}");
    EXPECT_EQ(sectionNode("Link"), "{State 'Searching', Signal Quality '0%'}");
    EXPECT_EQ(sectionNode("Registration"), "{State 'Searching', Registration State 'Searching'}");
}

TEST_F(ModemHonestyTest, NRStandalone) {
    update(cellMessage({cell("NR", "Serving", {{"PID", 655}, {"RSRP", -80}})}));
    update(modemMessage(LiveModemCode::link,
                        {{"kVoxModemState", 8}, {"kVoxLinkNR", dictionary({{"kVoxLinkRSRP", -80}})}}));
    expectReaderKnowsTheDisplay();
    EXPECT_EQ(sectionNode("Serving Cell"),
              "{State 'Registered', Radio Technology 'NR', PCI '655', RSRP '-80.0 dBm'}");
    EXPECT_EQ(sectionNode("Secondary Cell"), "{State 'None'}");
    EXPECT_EQ(sectionNode("Link"), "{State 'Registered', NR RSRP '-80.0 dBm'}");
    // And back: the order is the table's.
    for (const Data& message : registered())
        update(message);
    expectReaderKnowsTheDisplay();
    EXPECT_EQ(sectionNode("Link"),
              "{State 'Connected', Signal Quality '71%', NR RSRP '-93.0 dBm', LTE RSRP '-91.0 dBm'}");
}

TEST_F(ModemHonestyTest, OtherSIM) {
    update(modemMessage(LiveModemCode::sim, {{"kVoxModemState", 8}, {"kSimFile_ICCID", "8902222"}}));
    expectReaderKnowsTheDisplay();
    EXPECT_EQ(sectionNode("SIM"), "{State 'Registered', ICCID '8902222', Preferred Networks []}");
    EXPECT_EQ(sectionNode("SIM Slots"), "{State 'One slot', Slots []}");
    EXPECT_FALSE(shows("1111"));
}

TEST_F(ModemHonestyTest, ModemGone) {
    for (std::uint32_t code = LiveModemCode::sim; code <= LiveModemCode::position; ++code)
        // What it would still hold counts for nothing.
        update(modemMessage(code, {{"kVoxModemPresence", 4},
                                   {"kSimFile_ICCID", "8901111"},
                                   {"kVoxModemModel", "M1"},
                                   {"kVoxPositionLatitude", 1.5},
                                   {"kVoxCellMonitorCells", list({cell("GSM", "Serving", {{"BSIC", 1}})})}}));
    expectReaderKnowsTheDisplay();
    EXPECT_EQ(display(), "{Serving Cell {State 'No modem'}, Secondary Cell {State 'No modem'}, "
                         "Neighbor Cells {State 'No modem', Cells []}, Link {State 'No modem'}, "
                         "Registration {State 'No modem'}, "
                         "Packet Data Contexts {State 'No modem', Contexts []}, "
                         "Traffic {State 'No modem', Bearers []}, "
                         "SIM {State 'No modem', Preferred Networks []}, "
                         "SIM Slots {State 'No modem', Slots []}, Modem {State 'No modem'}, "
                         "Position {State 'No modem'}}");
}

// What was true may not be true any more.
TEST_F(ModemHonestyTest, AnUnreadableMessageEmptiesItsSections) {
    const LogLines lines = update(modemMessage(LiveModemCode::cells, list({})));
    int errors = 0;
    for (const CapturedLog::Line& line : lines)
        if (line.priority == LogPriority::Error) {
            ++errors;
            EXPECT_EQ(line.text, "Record 0xFF0001: the root is of kind array, wanted a dictionary");
        }
    EXPECT_EQ(errors, 1);
    expectReaderKnowsTheDisplay();
    EXPECT_EQ(sectionNode("Serving Cell"), "{State 'Unreadable message'}");
    EXPECT_EQ(sectionNode("Secondary Cell"), "{State 'Unreadable message'}");
    EXPECT_EQ(sectionNode("Neighbor Cells"), "{State 'Unreadable message', Cells []}");
    EXPECT_TRUE(shows("71%")); // the others stay
}

// A display that is not handed out in between shows the last message all the same.
TEST_F(ModemHonestyTest, TheLastOfManyMessagesCounts) {
    update(cellMessage({cell("GSM", "Serving", {{"BSIC", 1}})}));
    update(cellMessage({cell("LTE", "Serving", {{"PID", 5}})}));
    update(cellMessage({cell("UMTS", "Serving", {{"SCN", 6}})}));
    EXPECT_EQ(sectionNode("Serving Cell"), "{State 'Registered', Radio Technology 'UMTS', PSC '6'}");
    expectReaderKnowsTheDisplay();
}

TEST_F(ModemHonestyTest, AReconnectedDecoderContinuesAndForgets) {
    generator->setObservationSink(nullptr);
    generator = LogGenerator::generatorFromTechnology(kVoxLogChannelTechnology_Modem, clock);
    generator->setObservationSink(&reader);
    update(cellMessage({cell("GSM", "Serving", {{"BSIC", 1}})}));
    expectReaderKnowsTheDisplay();
    EXPECT_EQ(sectionNode("Serving Cell"),
              "{State 'Registered', Radio Technology 'GSM', BSIC '1', NCC-BCC '0-1'}");
}

} // namespace
} // namespace velmora

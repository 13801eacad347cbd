// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/Dictionary.h"
#include "Tests/Tools/Events/EventsFixture.h"
#include "Tests/Tools/FakeLogService.h"

#include <filesystem>
#include <fstream>
#include <set>

// velmora-log events --mask

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::Not;
using testing::SizeIs;

constexpr const char* firstCard = "8900101000000000017";
constexpr const char* secondCard = "8900101000000000025";

class EventsMaskTest : public EventsTest {
protected:
    EventsMaskTest() {
        std::ofstream(path("fleet.key")) << std::string(64, '7') << "\n";
        std::filesystem::permissions(path("fleet.key"), std::filesystem::perms::owner_read);
    }
    [[nodiscard]] static Data cardMessage(const char* number) {
        const auto files = makeDictionary();
        files->set("kSimFile_ICCID", number);
        return extraRecord(0, Value(files));
    }
    [[nodiscard]] std::vector<nlohmann::json> masked(std::vector<std::string> arguments) const {
        arguments.insert(arguments.end(), {"--key", path("fleet.key")});
        return listed(std::move(arguments));
    }
    /// Of each event's time and kind, and whether it has an address.
    [[nodiscard]] static std::vector<std::string> shapes(const std::vector<nlohmann::json>& events) {
        std::vector<std::string> shapes;
        for (const nlohmann::json& each : events)
            shapes.push_back(each["time"].get<std::string>() + " " + each["kind"].get<std::string>() +
                             (each["fields"].contains("address") ? " address" : ""));
        return shapes;
    }
};

TEST_F(EventsMaskTest, HasTheSameEventsWithoutTheirAddresses) {
    const std::string file = recordings + "modem.pcapng";
    const std::vector<nlohmann::json> events = listed({file});
    const std::vector<nlohmann::json> without = masked({"--mask", file});
    EXPECT_EQ(shapes(without), shapes(events));
    std::set<std::string> addresses;
    for (const nlohmann::json& each : events)
        if (each["fields"].contains("address"))
            addresses.insert(each["fields"]["address"].get<std::string>());
    EXPECT_FALSE(addresses.empty());
    for (const nlohmann::json& each : without)
        for (const std::string& address : addresses)
            EXPECT_THAT(each.dump(), Not(HasSubstr(address)));
}

TEST_F(EventsMaskTest, MasksNetworksAndCellsAtLevelLocationAlone) {
    const auto cells = [this](const std::string& level) {
        std::set<std::string> found;
        for (const nlohmann::json& each : masked({level, recordings + "ifx.pcapng"}))
            if (each["fields"].contains("to.cell"))
                found.insert(each["fields"]["to.cell"].dump());
        return found;
    };
    const std::set<std::string> identity = cells("--mask=identity");
    const std::set<std::string> location = cells("--mask=location");
    EXPECT_GT(identity.size(), 1U);
    EXPECT_EQ(location.size(), identity.size());
    EXPECT_NE(location, identity);
}

TEST_F(EventsMaskTest, FilesThatFollowEachOtherDoSoAtLevelAllToo) {
    writeRecording("first.pcapng", "Ostrel_GSM", {{at(0), rrState(4)}, {at(10'000), rrState(5)}});
    writeRecording("second.pcapng", "Ostrel_GSM", {{at(20'000), rrState(4)}});
    EXPECT_THAT(shapes(masked({"--mask=all", path("first.pcapng"), path("second.pcapng")})),
                ElementsAre("2000-01-01T00:00:10.000000000Z radio-state",
                            "2000-01-01T00:00:20.000000000Z radio-state"));
}

TEST_F(EventsMaskTest, WrongValuesAreRefused) {
    ToolProcess level(shipped({"events", "--mask=most", path("drive.pcapng")}));
    EXPECT_EQ(level.exitStatus(), 2);
    EXPECT_THAT(level.errors(), HasSubstr("wanted no value or one of identity, location, all"));
    ToolProcess key(shipped({"events", "--key", path("fleet.key"), path("drive.pcapng")}));
    EXPECT_EQ(key.exitStatus(), 2);
    ToolProcess none(shipped({"events", "--mask", "--key", path("none.key"), path("drive.pcapng")}));
    EXPECT_EQ(none.exitStatus(), 1);
    EXPECT_EQ(none.output(), "");
}

TEST_F(EventsMaskTest, MasksWhatTheServiceSends) {
    FakeLogService service(_directory / "ports", "Ostrel_GSM");
    ToolProcess process(shipped({"events", "--mask", "--format", "jsonl", "--count", "3"}));
    ASSERT_TRUE(eventually([&] { return service.streaming() == 1; }));
    service.send(cardMessage(firstCard));
    service.send(cardMessage(secondCard));
    service.send(cardMessage(firstCard));
    EXPECT_EQ(process.exitStatus(), 0) << process.errors();
    const std::vector<nlohmann::json> events = linesOf(process.output());
    ASSERT_THAT(events, SizeIs(2));
    for (const nlohmann::json& each : events) {
        EXPECT_EQ(each["kind"], "sim-change");
        EXPECT_THAT(each.dump(), Not(HasSubstr(firstCard)));
        EXPECT_THAT(each.dump(), Not(HasSubstr(secondCard)));
    }
    EXPECT_EQ(events[0]["fields"]["from"], events[1]["fields"]["to"]);
    EXPECT_THAT(events[0]["fields"]["from"].get<std::string>(), testing::MatchesRegex("89[0-9]{17}"));
}

} // namespace
} // namespace velmora

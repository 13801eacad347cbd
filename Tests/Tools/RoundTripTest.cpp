// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LogGenerator.h"
#include "LogMessages/LogMessage.h"
#include "Platform/Console.h"
#include "Platform/DateText.h"
#include "Platform/Linux/Files/FileResources.h"
#include "Platform/TelephonyService.h"
#include "PropertyLists/PropertyList.h"
#include "Recording/OpenMessages.h"
#include "Recording/Refreshes/RefreshTicks.h"
#include "Telephony/Drives/ScenarioRegistry.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Tools/FakeLogService.h"
#include "Tests/Tools/ToolFixture.h"
#include "Tools/Decode/Decoding.h"
#include "Tools/Report.h"

#include <gmock/gmock.h>

#include <chrono>
#include <cstdio>
#include <memory>
#include <string>
#include <vector>

// A drive of each technology goes from form to form, and shows the same in the end.

namespace velmora {
namespace {

/// A display at one moment, as text.
struct Shown {
    Time tick;
    std::string display;

    friend bool operator==(const Shown&, const Shown&) = default;
    friend void PrintTo(const Shown& shown, std::ostream* out) {
        *out << dateDescription(shown.tick) << ": " << shown.display;
    }
};

std::string textOf(const Value& display) {
    const auto text = writeXMLPropertyList(display);
    return text ? *text : text.reason();
}

class ShownRefreshes final : public DecodingObserver {
public:
    std::vector<Shown> all;
    void didRefresh(Time tick, const Decoded& decoded) override {
        all.push_back({tick, textOf(decoded.display)});
    }
};

class RoundTripTest : public ToolTest, public testing::WithParamInterface<const char*> {
protected:
    RoundTripTest() : _earlierConsole(redirectConsole(stderr)) {
        ::setenv("VELMORA_RESOURCES", VELMORA_SOURCE_DIR "/Resources", 1);
        _earlierResources = setResources(&_shipped);
        const auto scenario = scenarioKindNamed(GetParam())->make(7);
        _technology = shortTechnologyName(scenario->technology());
        for (ScenarioEvent event = scenario->next(); event.offset < std::chrono::seconds(60);
             event = scenario->next())
            _drive.push_back({at(0) + event.offset, event.message});
        writeRecording("drive.pcapng", _technology, _drive);
    }
    ~RoundTripTest() override {
        setResources(_earlierResources);
        redirectConsole(_earlierConsole);
    }

    [[nodiscard]] bool isBinary() const { return _technology != "IFX"; }
    [[nodiscard]] ToolProcess::Setup shippedTool(std::vector<std::string> arguments) const {
        ToolProcess::Setup setup = tool(std::move(arguments));
        setup.environment["VELMORA_RESOURCES"] = VELMORA_SOURCE_DIR "/Resources";
        return setup;
    }
    /// Converts the drive. The exit status.
    int convert(const std::string& name) const {
        ToolProcess process(shippedTool({"convert", path("drive.pcapng"), path(name)}));
        return process.exitStatus().value_or(-1);
    }
    [[nodiscard]] std::string decoded(const std::string& name) const {
        ToolProcess process(shippedTool({"decode", path(name)}));
        EXPECT_EQ(process.exitStatus(), 0) << process.errors();
        return process.output();
    }
    /// The refreshes of a file. Damaged messages of the drive may be losses.
    [[nodiscard]] std::vector<Shown> refreshesOf(const std::string& name) const {
        const auto reader = openMessages(path(name));
        ShownRefreshes refreshes;
        if (!reader) {
            ADD_FAILURE() << reader.reason();
            return {};
        }
        WorkContext context(name);
        const auto result = decodeMessages(**reader, DecodingRequest(), context, refreshes);
        EXPECT_TRUE(result);
        return refreshes.all;
    }

    FileResources _shipped;
    Resources* _earlierResources = nullptr;
    std::FILE* _earlierConsole;
    std::string _technology;
    std::vector<TimedMessage> _drive;
};

TEST_P(RoundTripTest, RecordedDriveDecodesToWhatAWatcherShowed) {
    FakeLogService service(_directory / "ports", _technology);
    ToolProcess watcher(shippedTool({"watch"}));
    ToolProcess recorder(
        shippedTool({"record", "--count", std::to_string(_drive.size()), path("recorded.pcapng")}));
    ASSERT_TRUE(eventually([&] { return service.streaming() == 2; }));
    for (const TimedMessage& message : _drive)
        service.send(message.message);
    ASSERT_EQ(recorder.exitStatus(), 0) << recorder.errors();
    const std::string display = decoded("recorded.pcapng");
    EXPECT_GT(display.size(), 100U);
    // The watcher's last refresh comes within 2 s.
    EXPECT_TRUE(eventually([&] { return watcher.output().ends_with("\n" + display); }))
        << watcher.output() << "\nrecorded:\n"
        << display;
}

TEST_P(RoundTripTest, RecordingIsTheSameByteForByte) {
    ASSERT_EQ(convert("copy.pcapng"), 0);
    EXPECT_EQ(contentOf("copy.pcapng"), contentOf("drive.pcapng"));
}

TEST_P(RoundTripTest, SnapshotShowsTheLastFiveRefreshes) {
    // The messages of each refresh. Decoding the messages of the last five again results in what a snapshot
    // can show.
    struct Refresh {
        std::vector<Data> messages;
        Time tick;
    };
    std::vector<Refresh> refreshes(1);
    RefreshTicks ticks;
    for (const TimedMessage& message : _drive) {
        if (const auto tick = ticks.tickBefore(message.time)) {
            refreshes.back().tick = *tick;
            refreshes.emplace_back();
        }
        refreshes.back().messages.push_back(message.message);
    }
    refreshes.back().tick = *ticks.last();
    ASSERT_GT(refreshes.size(), 5U);
    refreshes.erase(refreshes.begin(), refreshes.end() - 5);

    const FakeClock clock;
    const auto decoder = LogGenerator::generatorFromTechnology(technologyConstant(_technology), clock);
    Dictionary state;
    std::vector<Shown> expected;
    for (const Refresh& refresh : refreshes) {
        for (const Data& message : refresh.messages)
            decoder->updateState(state, message);
        const std::string display = textOf(decoder->generateLogUsingState(state));
        expected.push_back({std::chrono::floor<std::chrono::seconds>(refresh.tick), display});
    }

    ASSERT_EQ(convert("drive.velmora"), 0);
    EXPECT_EQ(refreshesOf("drive.velmora"), expected);
}

TEST_P(RoundTripTest, DLFLogHasTheRecords) {
    if (!isBinary()) {
        EXPECT_EQ(convert("drive.dlf"), 1) << "there is none";
        return;
    }
    // What a log's record chain needs: a complete header, and a correct length field.
    std::vector<Data> expected;
    for (const TimedMessage& message : _drive) {
        const auto header = LogMessage::parse(message.message.bytes());
        if (header && header->record.size() >= 13 && header->length() == header->record.size() - 1)
            expected.push_back(message.message);
    }
    EXPECT_GT(expected.size(), _drive.size() * 9 / 10);
    EXPECT_EQ(convert("drive.dlf"), expected.size() == _drive.size() ? 0 : 1);

    const auto reader = openMessages(path("drive.dlf"));
    ASSERT_TRUE(reader) << reader.reason();
    std::vector<Data> found;
    while (const auto message = (*reader)->next())
        found.push_back(Data::copyOf(message->message.bytes()));
    EXPECT_EQ((*reader)->lossTotals().losses, 0U);
    EXPECT_EQ((*reader)->technology(), _technology) << "told by the log codes";
    EXPECT_TRUE(found == expected) << found.size() << " of " << expected.size();
    EXPECT_EQ(decoded("drive.dlf"), decoded("drive.pcapng"));
}

INSTANTIATE_TEST_SUITE_P(EachTechnology, RoundTripTest,
                         testing::Values("gsm", "lte", "utran", "c2k", "ifx", "modem"),
                         [](const auto& tested) { return std::string(tested.param); });

} // namespace
} // namespace velmora

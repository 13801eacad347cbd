// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/LogGenerator.h"
#include "LogMessages/LogMessage.h"
#include "Platform/TelephonyService.h"
#include "PropertyLists/PropertyList.h"
#include "Telephony/Drives/ScenarioRegistry.h"
#include "Telephony/Sources/SourceFactory.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeMainQueue.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Support/ShippedResources.h"
#include "Tests/Support/TemporaryDirectory.h"
#include "Tests/Telephony/Drives/ScenarioTesting.h"
#include "Tests/Telephony/TelephonyTesting.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <chrono>
#include <fstream>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

inline std::string hexText(Bytes bytes) {
    std::string text;
    for (const std::uint8_t byte : bytes)
        text += {"0123456789ABCDEF"[byte >> 4], "0123456789ABCDEF"[byte & 0xF]};
    return text;
}

/// A drive and the application that saw it: a refresh every 2 s that had messages.
class ReplayFormsFixture : public ::testing::TestWithParam<std::string> {
protected:
    struct Refresh {
        Time time;
        std::vector<Data> messages;
        Value display;
    };

    ReplayFormsFixture() {
        for (const char* name : {"LTE", "Ostrel_GSM", "Ostrel_UTRAN", "C2KTemplate", "Modem"}) {
            const auto root = readPropertyList(shippedResource(std::string(name) + ".plist").bytes());
            resources.put(name, "plist", *root);
        }
        const auto scenario = scenarioKindNamed(GetParam())->make(1);
        technology = shortTechnologyName(scenario->technology());
        drive = driveOf(*scenario, std::chrono::seconds(61));
    }

    [[nodiscard]] std::unique_ptr<LogGenerator> decoder(const Clock& itsClock) const {
        return LogGenerator::generatorFromTechnology(technologyConstant(technology), itsClock);
    }

    /// Runs the drive through the application's decoder.
    void see() {
        FakeClock seen;
        const auto decodes = decoder(seen);
        std::vector<Data> messages;
        Time tick = seen.now() + std::chrono::seconds(2);
        const auto refresh = [&] {
            seen.setNow(tick);
            const Value display = decodes->generateLogUsingState(state);
            refreshes.push_back({tick, std::exchange(messages, {}), display.copy()});
        };
        for (const ScenarioEvent& event : drive) {
            for (; FakeClock::defaultNow() + event.offset >= tick; tick += std::chrono::seconds(2))
                if (!messages.empty())
                    refresh();
            decodes->updateState(state, event.message);
            messages.push_back(event.message);
        }
        refresh();
        saveContents = decodes->getSaveContentsFromState(state);
    }

    [[nodiscard]] std::string snapshot() const {
        const DictionaryRef root = makeDictionary();
        root->set("Timestamp", "2026-11-16 05:02:00 +0000");
        root->set("Data", saveContents);
        root->set("Description", "a drive");
        std::string path = (directory / "drive.velmora").string();
        std::ofstream(path) << *writeXMLPropertyList(root);
        return path;
    }

    /// What a display's raw messages keep of a message: none where that cannot be distinguished from what
    /// follows it.
    [[nodiscard]] std::optional<Data> kept(const Data& message) const {
        const auto header = LogMessage::parse(message.bytes());
        if (technology == "IFX")
            return message;
        if (!header)
            return std::nullopt;
        if (technology != "Ostrel_CDMA")
            return message;
        // Its decoder keeps what it has a parser for, less prefix.
        constexpr std::uint32_t parsed[] = {0x108A, 0x1183, 0x1192, 0x12B6, 0x119C, 0x119D, 0x127E, 0x134F};
        if (std::find(std::begin(parsed), std::end(parsed), header->logCode()) == std::end(parsed))
            return std::nullopt;
        return header->prefixed ? message.from(2) : message;
    }

    /// The messages that come out of the service.
    [[nodiscard]] std::vector<Data> replayed(const std::string& path) {
        const auto source = makeSource(ReplayChoice{path, 0, false, {}}, queue, clock);
        if (!source)
            throw std::runtime_error(source.reason());
        EXPECT_EQ((*source)->technology(), technologyConstant(technology));
        CollectingSink sink;
        (*source)->start(sink);
        while (!log.contains(LogPriority::Notice, path + ": played to the end, " +
                                                      std::to_string(sink.messages.size()) + " messages"))
            queue.advance(std::chrono::milliseconds(1));
        return sink.messages;
    }

    /// What the decoder shows of the messages in the end.
    [[nodiscard]] Value displayOf(const std::vector<Data>& messages) const {
        const auto decodes = decoder(clock);
        Dictionary shown;
        for (const Data& message : messages)
            decodes->updateState(shown, message);
        return shown["Display"].copy();
    }

    FakeClock clock;
    FakeMainQueue queue{clock};
    CapturedLog log;
    FakeResources resources;
    TemporaryDirectory directory;
    std::string technology;
    Drive drive;
    Dictionary state;
    std::vector<Refresh> refreshes;
    ArrayRef saveContents;
};

} // namespace velmora

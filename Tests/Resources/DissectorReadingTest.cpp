// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/LogMessage.h"
#include "LogMessages/RecordTime.h"
#include "Recording/OpenMessages.h"
#include "Tests/Recordings/ExampleRecording.h"
#include "Tests/Resources/Dissection.h"
#include "Tests/Resources/DissectorFixture.h"
#include "Tests/Resources/DissectorSections.h"
#include "Tests/Support/ShellCommand.h"

#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <ctime>
#include <sstream>
#include <string>
#include <vector>

/// The Wireshark dissector against our own reading of the same messages.

namespace velmora {
namespace {

std::string formatted(const char* format, auto value) {
    char text[64];
    std::snprintf(text, sizeof text, format, value);
    return text;
}

std::string lowerHex(Bytes bytes) {
    std::string text;
    for (const std::uint8_t byte : bytes)
        text += formatted("%02x", static_cast<unsigned>(byte));
    return text;
}

/// "Jan  5, 2026 08:00:00.048000005 UTC", as the capture tools write a moment.
std::string momentText(Time moment) {
    const auto seconds = std::chrono::floor<std::chrono::seconds>(moment);
    const std::time_t time = std::chrono::system_clock::to_time_t(
        std::chrono::time_point_cast<std::chrono::system_clock::duration>(seconds));
    std::tm parts{};
    ::gmtime_r(&time, &parts);
    char text[64];
    std::strftime(text, sizeof text, "%b %e, %Y %H:%M:%S", &parts);
    return text + formatted(".%09ld UTC", static_cast<long>((moment - seconds).count()));
}

/// Technology, prefix, type, length, code, sections, record, time and payload as we read them, separated by
/// tabs. A code without subscriber is skipped.
std::string ourReading(const std::string& technology, Bytes message) {
    const std::string name = technology + "\t";
    const auto header = LogMessage::parse(message);
    if (technology == "IFX")
        return name + "\t\t\t\t\t\t\t" + lowerHex(message);
    if (!header)
        return name + "\t\t\t\t\t\t\t";
    const bool anyType = technology == "Ostrel_CDMA";
    const bool known = header->type == LogMessage::basebandType || header->type == LogMessage::extraType;
    std::string sections;
    if (known)
        for (const std::string& section : sectionsWanting(technology, header->logCode()))
            sections += (sections.empty() ? "" : ";") + section;
    const auto time = header->timestamp() ? timeOfRecord(*header->timestamp()) : std::nullopt;
    const std::size_t begin = std::min(LogMessage::headerLength, header->record.size());
    return name + (header->prefixed ? lowerHex(message.first(LogMessage::prefixLength)) : "") + "\t" +
           formatted("0x%02x", static_cast<unsigned>(header->type)) + "\t" +
           std::to_string(header->length()) + "\t" +
           (known || anyType ? formatted("0x%06x", static_cast<unsigned>(header->logCode())) : "") + "\t" +
           sections + "\t" + (anyType ? recordName(header->logCode()) : "") + "\t" +
           (time ? momentText(*time) : "") + "\t" + lowerHex(header->record.subspan(begin));
}

const std::vector<std::string_view> ourFields = {
    "velmora.technology", "velmora.prefix", "velmora.type", "velmora.length",  "velmora.code",
    "velmora.sections",   "velmora.record", "velmora.time", "velmora.payload",
};

TEST_F(Dissector, agreesOnEveryMessageOfTheRecordings) {
    for (const ExampleRecording& recording : exampleRecordings()) {
        const std::string path = VELMORA_SOURCE_DIR "/Tests/Recordings/" + recording.fileName();
        const auto reader = openMessages(path);
        ASSERT_TRUE(reader) << reader.reason();
        std::vector<std::string> wanted;
        while (const auto message = (*reader)->next())
            wanted.push_back(ourReading((*reader)->technology(), message->message.bytes()));
        const std::vector<std::string> found = dissectedFields(path, ourFields);
        ASSERT_EQ(found.size(), wanted.size()) << path;
        ASSERT_GT(found.size(), 50U);
        for (std::size_t i = 0; i < found.size(); ++i)
            EXPECT_EQ(found[i], wanted[i]) << "message " << i + 1 << " of " << path;
    }
}

/// The code and the sections of each message, as velmora-log lists it.
TEST_F(Dissector, agreesWithTheCommandLine) {
    for (const ExampleRecording& recording : exampleRecordings()) {
        const std::string path = VELMORA_SOURCE_DIR "/Tests/Recordings/" + recording.fileName();
        const ShellOutcome outcome =
            runShell("VELMORA_RESOURCES=" + shellQuoted(VELMORA_SOURCE_DIR "/Resources") + " " +
                     shellQuoted(VELMORA_BUILD_DIR "/velmora-log") +
                     " decode --format jsonl --every message " + shellQuoted(path));
        ASSERT_EQ(outcome.status, 0);
        std::istringstream lines(outcome.output);
        std::vector<std::string> wanted;
        for (std::string line; std::getline(lines, line);) {
            const auto message = nlohmann::ordered_json::parse(line);
            std::string text;
            if (const auto code = message.find("code"); code != message.end() && code->is_number())
                text = formatted("0x%06x", code->get<unsigned>());
            text += "\t";
            bool first = true;
            if (const auto sections = message.find("sections"); sections != message.end())
                for (const auto& [name, node] : sections->items()) {
                    text += (first ? "" : ";") + name;
                    first = false;
                }
            wanted.push_back(text);
        }
        EXPECT_EQ(dissectedFields(path, {"velmora.code", "velmora.sections"}), wanted) << path;
    }
}

} // namespace
} // namespace velmora

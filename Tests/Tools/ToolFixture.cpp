// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/ToolFixture.h"

#include "PropertyLists/PropertyList.h"
#include "Recording/Pcapng/PcapngWriter.h"

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <stdexcept>

namespace velmora {

namespace {

constexpr const char* displayTemplate = R"(<?xml version="1.0" encoding="UTF-8"?>
<plist version="1.0">
<dict>
    <key>GSM RR Info</key><dict/>
    <key>UMTS RR Info</key><dict/>
    <key>SIM Info</key><dict/>
</dict>
</plist>
)";

} // namespace

Data rrState(std::uint8_t state) {
    const std::uint8_t payload[] = {
        state,
        0x00, // sub state
        0x01, // status
        0x00, // mode
    };
    return recordOf(0x512C, payload);
}

Data serialized(const Value& value) {
    const Result<std::string> xml = writeXMLPropertyList(value);
    if (!xml)
        throw std::invalid_argument(xml.reason());
    return Data(std::vector<std::uint8_t>(xml->begin(), xml->end()));
}

ToolTest::ToolTest() {
    std::filesystem::create_directory(_directory / "resources");
    std::filesystem::create_directory(_directory / "ports");
    std::filesystem::permissions(_directory / "ports", std::filesystem::perms::owner_all);
    std::ofstream(_directory / "resources/Ostrel_GSM.plist") << displayTemplate;
}

std::vector<std::uint64_t> ToolTest::writeRecording(const std::string& name, const std::string& technology,
                                                    const std::vector<TimedMessage>& messages) const {
    const auto writer = PcapngWriter::create(path(name), technology);
    if (!writer)
        throw std::runtime_error(writer.reason());
    std::vector<std::uint64_t> offsets;
    for (const TimedMessage& message : messages) {
        offsets.push_back(std::filesystem::file_size(path(name)));
        if (!(*writer)->append(message.time, message.message.bytes()) || !(*writer)->flush())
            throw std::runtime_error("no message written");
    }
    offsets.push_back(std::filesystem::file_size(path(name)));
    if (!(*writer)->close())
        throw std::runtime_error("not closed");
    return offsets;
}

std::string ToolTest::contentOf(const std::string& name) const {
    std::ifstream file(path(name), std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
}

ToolProcess::Setup ToolTest::tool(std::vector<std::string> arguments) const {
    ToolProcess::Setup setup;
    setup.arguments = std::move(arguments);
    setup.environment = {
        {"VELMORA_RESOURCES", path("resources")}, {"VELMORA_PORT_DIR", path("ports")}, {"TZ", "UTC"}};
    return setup;
}

std::vector<std::string> ToolTest::portFiles() const {
    std::vector<std::string> names;
    for (const auto& entry : std::filesystem::directory_iterator(_directory / "ports"))
        names.push_back(entry.path().filename().string());
    std::sort(names.begin(), names.end());
    return names;
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/ModemManagerProcesses.h"

#include "LogMessages/LogMessage.h"
#include "PropertyLists/PropertyList.h"
#include "Tests/Telephony/ModemManager/ModemManagerFixture.h"

#include <algorithm>
#include <cstdlib>
#include <string_view>
#include <utility>

namespace velmora {
namespace {

/// Without colours, and with one blank in place of several.
std::string squeezed(std::string_view text) {
    std::string result;
    for (std::size_t i = 0; i < text.size(); ++i) {
        if (text[i] == '\x1b')
            i = std::min(text.find('m', i), text.size());
        else if (text[i] != ' ' || !result.ends_with(' '))
            result += text[i];
    }
    return result;
}

} // namespace

ModemManagerProcesses::ModemManagerProcesses(const std::string& rules) : bus(rules) {
    for (const char* name : {"DBUS_SYSTEM_BUS_ADDRESS", "DBUS_SESSION_BUS_ADDRESS"})
        ::setenv(name, bus.address().c_str(), 1);
}

ModemManagerProcesses::~ModemManagerProcesses() {
    for (const char* name : {"DBUS_SYSTEM_BUS_ADDRESS", "DBUS_SESSION_BUS_ADDRESS"})
        ::unsetenv(name);
}

std::unique_ptr<TestProcess> ModemManagerProcesses::start(const std::string& program,
                                                          std::vector<std::string> arguments) const {
    return std::make_unique<TestProcess>(program, std::move(arguments), directory.path());
}

std::unique_ptr<TestProcess> ModemManagerProcesses::startTool(std::vector<std::string> arguments) const {
    return start(VELMORA_BUILD_DIR "/velmora-log", std::move(arguments));
}

void ModemManagerProcesses::serve(const std::string& source, const std::string& line) {
    service = start(VELMORA_BUILD_DIR "/velmora-telephonyd", {"--source", source, "--log-level", "5"});
    ASSERT_TRUE(eventually([&] { return service->standardError().find(line + '\n') != std::string::npos; }))
        << service->standardError();
}

Value ModemManagerProcesses::latest(const TestClient& client, std::uint32_t code,
                                    const std::vector<std::string>& path) {
    for (auto message = client.messages.rbegin(); message != client.messages.rend(); ++message) {
        const auto header = LogMessage::parse(message->bytes());
        if (!header || header->logCode() != code)
            continue;
        const auto root = readPropertyList(message->bytes().subspan(LogMessage::headerLength));
        return root ? at(*root, path) : Value();
    }
    return {};
}

bool ModemManagerProcesses::becomes(const TestClient& client, std::uint32_t code,
                                    const std::vector<std::string>& path, const Value& value) {
    return eventually([&] { return latest(client, code, path) == value; });
}

std::string ModemManagerProcesses::mmcli(std::vector<std::string> arguments) const {
    arguments.insert(arguments.begin(), "--timeout=30");
    const auto client = start("/usr/bin/mmcli", std::move(arguments));
    static_cast<void>(client->exitStatus());
    return squeezed(client->standardOutput() + client->standardError());
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Model/ServiceCommands.h"

#include "Platform/SystemLog.h"
#include "Platform/TelephonyService.h"
#include "PropertyLists/PropertyList.h"

#include <chrono>

namespace velmora {

using namespace std::chrono_literals;

namespace {

constexpr auto commandTimeout = 1s;

Result<Data> serialize(const DictionaryRef& command) {
    Result<std::string> xml = writeXMLPropertyList(command);
    if (!xml)
        return Failure{xml.reason()};
    return Data(std::vector<std::uint8_t>(xml->begin(), xml->end()));
}

} // namespace

std::optional<Value> askTechnology(RemotePort& channel) {
    const DictionaryRef request = makeDictionary();
    request->set(vox::getTechnologyKey, vox::getTechnologyKey);
    const Result<Data> data = serialize(request);
    if (!data) {
        logLine(LogPriority::Error, " Could not generate GetTechnology command; cannot configure");
        return std::nullopt;
    }
    const RemotePort::Answer answer = channel.sendRequest(0, *data, commandTimeout, commandTimeout, true);
    if (answer.status != PortStatus::Success) {
        logFormat(LogPriority::Error, " ***** Could not send the GetTechnology command (got error=%d)",
                  answer.status);
        return std::nullopt;
    }
    if (!answer.reply) {
        logLine(LogPriority::Error, " ***** No response to GetTechnology; cannot configure");
        return std::nullopt;
    }
    const Result<Value> reply = readPropertyList(answer.reply->bytes());
    if (!reply) {
        logLine(LogPriority::Error, " ***** Could not parse reply to GetTechnology; cannot configure");
        return std::nullopt;
    }
    const Dictionary* answers = reply->asDictionary();
    const Value* technology = answers ? answers->find(vox::getTechnologyKey) : nullptr;
    if (!technology) {
        logLine(LogPriority::Error, " ***** Reply to GetTechnology had no answer; cannot configure");
        return std::nullopt;
    }
    return *technology;
}

bool sendStartCommand(RemotePort& channel, const DictionaryRef& command) {
    const Result<Data> data = serialize(command);
    if (!data) {
        logLine(LogPriority::Error, " Could not generate PLIST");
        return false;
    }
    const RemotePort::Answer answer = channel.sendRequest(0, *data, commandTimeout, 0s, false);
    if (answer.status != PortStatus::Success) {
        logFormat(LogPriority::Error, " ***** Could not send the START command (got error=%d)",
                  answer.status);
        return false;
    }
    return true;
}

} // namespace velmora

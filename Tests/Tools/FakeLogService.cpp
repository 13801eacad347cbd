// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/FakeLogService.h"

#include "Platform/TelephonyService.h"
#include "PropertyLists/PropertyList.h"
#include "Tests/Tools/ToolFixture.h"

#include <algorithm>
#include <stdexcept>
#include <utility>

namespace velmora {

namespace {

PortOptions optionsFor(const std::filesystem::path& directory) {
    PortOptions options;
    options.directory = directory;
    return options;
}

Data dictionaryOf(std::string_view key, const std::string& text) {
    const DictionaryRef dictionary = makeDictionary();
    dictionary->set(key, text);
    return serialized(dictionary);
}

} // namespace

FakeLogService::FakeLogService(const std::filesystem::path& directory, std::string technology)
    : _ports(optionsFor(directory)), _technology(std::move(technology)) {
    MessagePorts::Created created = _ports.createLocal(
        std::string(vox::serverPortName),
        [this](LocalPort&, std::int32_t, const Data& request) { return createChannel(request); });
    if (!created.port || created.alreadyExisted)
        throw std::runtime_error("no server port");
    _server = std::move(created.port);
    _server->attachToMainQueue();
}

FakeLogService::~FakeLogService() {
    _server->invalidate();
    for (const auto& channel : _channels)
        channel->invalidate();
    for (const auto& client : _clients)
        client->invalidate();
}

void FakeLogService::send(const Data& message) {
    for (const auto& client : _clients)
        client->post(0, message);
}

void FakeLogService::sendEnd() {
    for (const auto& client : _clients)
        client->post(1, Data());
}

bool FakeLogService::isAllTaken() const {
    return std::all_of(_clients.begin(), _clients.end(),
                       [](const auto& client) { return client->waitingMessages() == 0; });
}

std::optional<Data> FakeLogService::createChannel(const Data& request) {
    const Result<Value> parsed = readPropertyList(request.bytes());
    const std::string client = *(*parsed->asDictionary())[vox::createLogChannelKey].asString();
    const std::string name = "com.velmora.test.channel." + std::to_string(_channels.size());
    MessagePorts::Created created =
        _ports.createLocal(name, [this, client](LocalPort&, std::int32_t, const Data& payload) {
            return command(client, payload);
        });
    created.port->attachToMainQueue();
    _channels.push_back(std::move(created.port));
    return dictionaryOf(vox::portKey, name);
}

std::optional<Data> FakeLogService::command(const std::string& client, const Data& payload) {
    const Result<Value> parsed = readPropertyList(payload.bytes());
    if (parsed->asDictionary()->contains(vox::getTechnologyKey) && _technology.empty())
        return serialized(makeDictionary());
    if (parsed->asDictionary()->contains(vox::getTechnologyKey))
        return dictionaryOf(vox::getTechnologyKey, technologyConstant(_technology));
    if (std::shared_ptr<RemotePort> port = _ports.createRemote(client))
        _clients.push_back(std::move(port));
    return std::nullopt;
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Model/SocketService.h"

#include "Platform/Linux/MainLoop.h"
#include "Platform/Linux/Ports/LinuxMessagePorts.h"
#include "Platform/Linux/QtMainQueue.h"
#include "Platform/TelephonyService.h"
#include "PropertyLists/PropertyList.h"
#include "Tests/Support/Hex.h"
#include "Tests/Support/OwnProgram.h"

#include <csignal>
#include <cstdio>
#include <ctime>
#include <stdexcept>
#include <sys/wait.h>
#include <unistd.h>

#include <chrono>
#include <memory>
#include <optional>

namespace velmora {

namespace {

using namespace std::chrono_literals;

Data dictionaryOf(std::string_view key, std::string_view text) {
    const DictionaryRef dictionary = makeDictionary();
    dictionary->set(key, text);
    const auto xml = writeXMLPropertyList(dictionary);
    return Data::copyOf(Bytes(reinterpret_cast<const std::uint8_t*>(xml->data()), xml->size()));
}

class Service {
public:
    Service(const std::string& directory, std::string manner)
        : _manner(std::move(manner)), _ports(optionsFor(directory)) {
        _server = listening(std::string(vox::serverPortName), [this](const Data& request) {
            _client = *(*parsed(request).asDictionary())[vox::createLogChannelKey].asString();
            return std::optional(dictionaryOf(vox::portKey, "com.velmora.test.channel"));
        });
        _channel = listening("com.velmora.test.channel", [this](const Data& request) {
            return parsed(request).asDictionary()->contains(vox::getTechnologyKey) ? technology() : start();
        });
    }

private:
    static PortOptions optionsFor(const std::string& directory) {
        PortOptions options;
        options.directory = directory;
        return options;
    }
    static Value parsed(const Data& request) { return *readPropertyList(request.bytes()); }

    std::shared_ptr<LocalPort> listening(const std::string& name,
                                         std::function<std::optional<Data>(const Data&)> answer) {
        auto created = _ports.createLocal(
            name, [answer = std::move(answer)](LocalPort&, std::int32_t, const Data& payload) {
                return answer(payload);
            });
        if (!created.port || created.alreadyExisted)
            throw std::runtime_error("no port " + name);
        created.port->attachToMainQueue();
        return created.port;
    }

    std::optional<Data> technology() {
        if (_manner == "no-data")
            return std::nullopt;
        if (_manner == "rubbish")
            return hex("DE AD");
        if (_manner == "unknown")
            return dictionaryOf(vox::getTechnologyKey, "kVoxLogChannelTechnology_Unheard");
        if (_manner == "no-answer")
            return dictionaryOf("Other", "x");
        if (_manner == "late") {
            // Longer than the application waits. The service is stuck meanwhile, as a busy one would be.
            const timespec time = {1, 200'000'000};
            ::nanosleep(&time, nullptr);
        }
        return dictionaryOf(vox::getTechnologyKey, kVoxLogChannelTechnology_Ostrel_GSM);
    }

    std::optional<Data> start() {
        _sink = _ports.createRemote(_client);
        _ticks = _queue.repeating(20ms, [this] {
            if (_sink)
                _sink->post(0, record(0x7132, "01 00 00"));
        });
        return std::nullopt;
    }

    std::string _manner;
    LinuxMessagePorts _ports;
    QtMainQueue _queue;
    std::shared_ptr<LocalPort> _server;
    std::shared_ptr<LocalPort> _channel;
    std::string _client;
    std::shared_ptr<RemotePort> _sink;
    std::unique_ptr<Timer> _ticks;
};

} // namespace

int SocketService::main(const std::string& directory, const std::string& manner) {
    MainLoop loop;
    const Service service(directory, manner);
    std::puts("ready");
    std::fflush(stdout);
    return loop.run();
}

SocketService::SocketService(const std::string& directory, const std::string& manner) {
    int ready[2];
    if (::pipe(ready) != 0)
        throw std::runtime_error("no pipe");
    _id = ::fork();
    if (_id == 0) {
        ::dup2(ready[1], STDOUT_FILENO);
        ::close(ready[0]);
        ::close(ready[1]);
        ::execl(ownProgram(), "service", "--service", directory.c_str(), manner.c_str(), nullptr);
        ::_exit(127);
    }
    ::close(ready[1]);
    char text[6];
    const auto length = ::read(ready[0], text, sizeof text); // until it listens, or has ended
    ::close(ready[0]);
    if (length <= 0)
        throw std::runtime_error("the service did not start");
}

SocketService::~SocketService() {
    kill();
}

void SocketService::kill() {
    if (_id <= 0)
        return;
    ::kill(_id, SIGKILL);
    ::waitpid(_id, nullptr, 0);
    _id = -1;
}

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/LogMessage.h"
#include "Model/ServiceCommands.h"
#include "Platform/Linux/MainLoop.h"
#include "Platform/Linux/Ports/LinuxMessagePorts.h"
#include "Platform/Linux/Ports/LinuxTelephonyService.h"

#include <chrono>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <iostream>
#include <optional>
#include <string>
#include <vector>

#include <sys/resource.h>
#include <unistd.h>

// A client of velmora-telephonyd that decodes nothing, for measure-service: what the ports alone cost. Each
// message has its number in place of its time stamp, and is due a fixed time after the one before.
//
//   stream-client INTERVAL_us FIRST OFFSETS
//
// Connects, prints a line, and streams once it reads one. At the source's end it prints how many messages
// from number FIRST on it has got and how many it has missed, and its processor time in seconds since it
// began to stream. The file OFFSETS gets a 64-bit number for each of them: the nanoseconds of its arrival
// less those at which it was due, by a clock that all processes have in common.

namespace velmora {
namespace {

using Clock = std::chrono::steady_clock;

double processorTime_s() {
    rusage usage{};
    ::getrusage(RUSAGE_SELF, &usage);
    const auto seconds = [](const timeval& time) {
        return static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_usec) / 1e6;
    };
    return seconds(usage.ru_utime) + seconds(usage.ru_stime);
}

/// What has arrived.
class Arrivals {
public:
    Arrivals(std::int64_t interval_us, std::uint64_t first) : _interval_us(interval_us), _first(first) {}

    void add(const Data& message) {
        const std::int64_t now = std::chrono::nanoseconds(Clock::now().time_since_epoch()).count();
        const std::optional<LogMessage> header = LogMessage::parse(message.bytes());
        const std::uint64_t number = header ? header->timestamp().value_or(0) : 0;
        if (number < _first)
            return;
        // Messages come in order; those that are left out were dropped on the way.
        _missed += _offsets.empty() ? 0 : number - _last - 1;
        _last = number;
        _offsets.push_back(now - static_cast<std::int64_t>(_last) * _interval_us * 1000);
    }

    [[nodiscard]] bool write(const char* path) const {
        std::ofstream file(path, std::ios::binary);
        // The bytes of the numbers are what the file is to have.
        file.write(reinterpret_cast<const char*>(_offsets.data()),
                   static_cast<std::streamsize>(_offsets.size() * sizeof _offsets.front()));
        return file.good();
    }
    [[nodiscard]] std::size_t received() const { return _offsets.size(); }
    [[nodiscard]] std::uint64_t missed() const { return _missed; }

private:
    std::int64_t _interval_us;
    std::uint64_t _first;
    std::uint64_t _last = 0;
    std::uint64_t _missed = 0;
    std::vector<std::int64_t> _offsets;
};

int stream(std::int64_t interval_us, std::uint64_t first, const char* path) {
    MainLoop loop;
    LinuxMessagePorts ports(PortOptions::forClients());
    LinuxTelephonyService telephony(ports);
    Arrivals arrivals(interval_us, first);
    const std::string name = "com.velmora.bench." + std::to_string(::getpid());
    const auto take = [&](LocalPort&, std::int32_t id, const Data& message) -> std::optional<Data> {
        if (id == vox::sourceEndedMessage)
            loop.quit(EXIT_SUCCESS);
        else
            arrivals.add(message);
        return std::nullopt;
    };
    const auto local = ports.createLocal(name, take).port;
    if (!local)
        return EXIT_FAILURE;
    local->attachToMainQueue();
    const auto connection = telephony._VoxServerConnectionCreate([] {});
    std::string channelName;
    if (!connection ||
        telephony._VoxServerConnectionNetworkMonitorCreateLogChannel(*connection, name, channelName).code !=
            0)
        return EXIT_FAILURE;
    const auto channel = ports.createRemote(channelName);
    if (!channel)
        return EXIT_FAILURE;
    std::cout << "connected" << std::endl;
    std::string line;
    std::getline(std::cin, line);
    const DictionaryRef command = makeDictionary();
    command->set(vox::setStateKey, vox::streamingState);
    if (!sendStartCommand(*channel, command))
        return EXIT_FAILURE;
    const double begun = processorTime_s();
    const int status = loop.run();
    std::cout << arrivals.received() << ' ' << arrivals.missed() << ' ' << processorTime_s() - begun
              << std::endl;
    return arrivals.write(path) ? status : EXIT_FAILURE;
}

} // namespace
} // namespace velmora

int main(int count, char** arguments) {
    if (count != 4) {
        std::fputs("usage: stream-client INTERVAL_us FIRST OFFSETS\n", stderr);
        return 2;
    }
    return velmora::stream(std::atoll(arguments[1]), std::strtoull(arguments[2], nullptr, 10), arguments[3]);
}

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/MainLoop.h"
#include "Platform/Linux/Ports/LinuxMessagePorts.h"

#include <benchmark/benchmark.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <cstdlib>
#include <filesystem>
#include <stdexcept>
#include <string>

/// Message ports over real sockets: how many small messages a second go from a sender to a receiver in
/// another process and come in, and how long a request waits for its reply.

namespace velmora {

namespace {

using namespace std::chrono_literals;

constexpr std::size_t payloadSize = 64;

/// A process that owns the port "echo", answers requests with their payload, and takes one-way messages.
/// Forked before this process has an event loop of its own.
class Echo {
public:
    Echo() {
        std::string pattern = "/tmp/velmora-bench-XXXXXX";
        if (!::mkdtemp(pattern.data()))
            throw std::runtime_error("no temporary directory");
        _options.directory = pattern;
        int ends[2];
        if (::pipe(ends) != 0)
            throw std::runtime_error("no pipe");
        _id = ::fork();
        if (_id == 0)
            ::_exit(serve(ends[1]));
        ::close(ends[1]);
        char ready = 0;
        if (::read(ends[0], &ready, 1) != 1)
            throw std::runtime_error("the echo process did not start");
        ::close(ends[0]);
    }
    ~Echo() {
        ::kill(_id, SIGKILL);
        ::waitpid(_id, nullptr, 0);
        std::filesystem::remove_all(*_options.directory);
    }
    Echo(const Echo&) = delete;
    Echo& operator=(const Echo&) = delete;

    [[nodiscard]] const PortOptions& options() const { return _options; }

private:
    int serve(int ready) const {
        MainLoop loop;
        const auto created = LinuxMessagePorts(_options).createLocal(
            "echo", [](LocalPort&, std::int32_t, const Data& payload) { return std::optional(payload); });
        created.port->attachToMainQueue();
        return ::write(ready, "r", 1) == 1 ? loop.run() : 1;
    }

    PortOptions _options;
    pid_t _id = -1;
};

void oneWayMessages(benchmark::State& state) {
    const Echo echo;
    MainLoop loop;
    const auto port = LinuxMessagePorts(echo.options()).createRemote("echo");
    const Data payload(std::vector<std::uint8_t>(payloadSize, 0xA5));
    constexpr int batch = 10'000;
    for (auto _ : state) {
        for (int i = 0; i < batch; ++i)
            port->post(0, payload);
        // The reply to a request that follows the messages: all of them have been received.
        if (port->sendRequest(0, payload, 10s, 10s, true).status != PortStatus::Success)
            state.SkipWithError("the receiver does not answer");
    }
    if (port->droppedMessages() > 0)
        state.SkipWithError("messages were dropped");
    state.SetItemsProcessed(state.iterations() * batch);
}
BENCHMARK(oneWayMessages)->UseRealTime();

void requestAndReply(benchmark::State& state) {
    const Echo echo;
    MainLoop loop;
    const auto port = LinuxMessagePorts(echo.options()).createRemote("echo");
    const Data payload(std::vector<std::uint8_t>(payloadSize, 0xA5));
    for (auto _ : state)
        if (port->sendRequest(0, payload, 10s, 10s, true).status != PortStatus::Success)
            state.SkipWithError("the receiver does not answer");
}
BENCHMARK(requestAndReply)->UseRealTime();

} // namespace

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/MainLoop.h"
#include "Platform/Linux/Ports/LinuxMessagePorts.h"
#include "Platform/Linux/SignalWatcher.h"
#include "Tests/Platform/LinuxPortFixture.h"

#include <gmock/gmock.h>

#include <cstdio>
#include <string_view>

namespace velmora {

namespace {

MainLoop* loop = nullptr;

/// What EchoProcess starts; ends with status 7 on SIGTERM.
int echo(const char* directory, const char* name) {
    MainLoop own;
    const SignalWatcher signals([&own](int) { own.quit(7); });
    PortOptions options;
    options.directory = directory;
    LinuxMessagePorts ports(options);
    const auto created = ports.createLocal(
        name, [](LocalPort&, std::int32_t, const Data& payload) { return std::optional(payload); });
    if (!created.port || created.alreadyExisted)
        return 1;
    created.port->attachToMainQueue();
    std::puts("ready");
    std::fflush(stdout);
    return own.run();
}

} // namespace

MainLoop& testLoop() {
    return *loop;
}

} // namespace velmora

int main(int argc, char** argv) {
    if (argc == 4 && std::string_view(argv[1]) == "--echo")
        return velmora::echo(argv[2], argv[3]);
    testing::InitGoogleMock(&argc, argv);
    velmora::MainLoop own;
    velmora::loop = &own;
    return RUN_ALL_TESTS();
}

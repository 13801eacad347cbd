// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/TelephonydProcess.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <string_view>

namespace {

velmora::MainLoop* theLoop = nullptr;

/// Streams until it is killed; says so once messages come.
int runClient(const char* directory, const char* name) {
    velmora::TestClient client(directory, name);
    if (!client.connect() || !client.stream())
        return 1;
    if (!velmora::eventually([&] { return client.messages.size() >= 10; }))
        return 1;
    std::puts("streaming");
    std::fflush(stdout);
    return theLoop->run();
}

} // namespace

namespace velmora {

MainLoop& testLoop() {
    return *theLoop;
}

} // namespace velmora

int main(int argc, char** argv) {
    velmora::MainLoop loop;
    theLoop = &loop;
    if (argc == 4 && std::string_view(argv[1]) == "--client")
        return runClient(argv[2], argv[3]);
    ::testing::InitGoogleTest(&argc, argv);
    return RUN_ALL_TESTS();
}

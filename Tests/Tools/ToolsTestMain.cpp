// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/ToolProcess.h"

#include <gmock/gmock.h>

namespace {

velmora::MainLoop* theLoop = nullptr;

} // namespace

namespace velmora {

MainLoop& testLoop() {
    return *theLoop;
}

} // namespace velmora

int main(int argc, char** argv) {
    testing::InitGoogleMock(&argc, argv);
    velmora::MainLoop loop;
    theLoop = &loop;
    return RUN_ALL_TESTS();
}

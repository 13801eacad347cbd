// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Toolkit/ToolkitTest.h"

#include <QApplication>

namespace {

velmora::Application* theApplication = nullptr;

} // namespace

namespace velmora {

Application& testApplication() {
    return *theApplication;
}

} // namespace velmora

int main(int argc, char** argv) {
    qputenv("QT_QPA_PLATFORM", "offscreen");
    qunsetenv("VELMORA_REDUCED_MOTION");
    ::testing::InitGoogleTest(&argc, argv);
    velmora::Application application(argc, argv);
    theApplication = &application;
    QApplication::setDoubleClickInterval(0); // clicks of one test are no double clicks with the last one's
    return RUN_ALL_TESTS();
}

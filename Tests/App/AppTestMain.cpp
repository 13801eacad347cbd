// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include <gmock/gmock.h>

#include <cstdlib>

int main(int argc, char** argv) {
    // No display, no bus, no desktop settings: every machine shows the same.
    const char* const platform = std::getenv("VELMORA_TEST_PLATFORM"); // a display of the test's own
    ::setenv("QT_QPA_PLATFORM", platform ? platform : "offscreen", 1);
    ::setenv("QT_QPA_PLATFORMTHEME", "", 1);
    ::setenv("VELMORA_REDUCED_MOTION", "1", 0); // what is opened is there at once
    ::unsetenv("QT_STYLE_OVERRIDE");
    // A display of the test's own has that scale by itself.
    const char* const scale = std::getenv("VELMORA_TEST_SCALE");
    ::setenv("QT_SCALE_FACTOR", scale && !platform ? scale : "1", 1);
    testing::InitGoogleMock(&argc, argv);
    return RUN_ALL_TESTS();
}

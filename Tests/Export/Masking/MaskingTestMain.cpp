// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/QuietProcess.h"
#include "Tests/Support/FakeResources.h"

#include <gtest/gtest.h>

int main(int argc, char** argv) {
    testing::InitGoogleTest(&argc, argv);
    const velmora::QuietProcess quiet; // decoders print when they end
    const velmora::FakeResources resources;
    return RUN_ALL_TESTS();
}

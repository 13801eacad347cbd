// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Jobs/UsableProcessors.h"

#include <gtest/gtest.h>

#include <sched.h>

namespace velmora {
namespace {

TEST(UsableProcessorsTest, AreThoseThatTheProcessMayRunOn) {
    cpu_set_t all;
    ASSERT_EQ(::sched_getaffinity(0, sizeof all, &all), 0);
    EXPECT_EQ(usableProcessors(), static_cast<std::size_t>(CPU_COUNT(&all)));
    int last = -1;
    for (int processor = 0; processor < CPU_SETSIZE; ++processor)
        if (CPU_ISSET(processor, &all))
            last = processor;
    cpu_set_t one;
    CPU_ZERO(&one);
    CPU_SET(last, &one);
    ASSERT_EQ(::sched_setaffinity(0, sizeof one, &one), 0);
    EXPECT_EQ(usableProcessors(), 1U);
    ASSERT_EQ(::sched_setaffinity(0, sizeof all, &all), 0);
}

} // namespace
} // namespace velmora

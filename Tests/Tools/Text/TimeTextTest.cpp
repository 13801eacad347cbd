// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Text/TimeText.h"

#include <gtest/gtest.h>

#include <string>

namespace velmora {
namespace {

using namespace std::chrono;

TEST(TimeTextTest, MomentsShowToTheNanosecond) {
    struct Case {
        Time moment;
        const char* text;
    };
    const Time day = sys_days{year{2026} / November / 16};
    const Case cases[] = {
        {day, "2026-11-16T00:00:00.000000000Z"},
        {day + hours{5} + minutes{4} + seconds{3} + nanoseconds{20}, "2026-11-16T05:04:03.000000020Z"},
        {day + hours{24} - nanoseconds{1}, "2026-11-16T23:59:59.999999999Z"},
        {day + hours{24}, "2026-11-17T00:00:00.000000000Z"},
        {sys_days{year{2024} / February / 29}, "2024-02-29T00:00:00.000000000Z"},
        {Time{}, "1970-01-01T00:00:00.000000000Z"},
        {Time{} - nanoseconds{1}, "1969-12-31T23:59:59.999999999Z"},
        {Time::min(), "1677-09-21T00:12:43.145224192Z"},
        {Time::max(), "2262-04-11T23:47:16.854775807Z"},
    };
    // With one writer, which remembers the day, and with a new one each.
    TimeText remembering;
    for (const Case& row : cases) {
        TextBuffer out;
        remembering.append(out, row.moment);
        EXPECT_EQ(out.view(), row.text);
        EXPECT_EQ(out.size(), TimeText::length);
        out.clear();
        TimeText().append(out, row.moment);
        EXPECT_EQ(out.view(), row.text);
    }
}

} // namespace
} // namespace velmora

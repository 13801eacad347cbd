// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/Playback/MomentText.h"

#include "Tests/Support/FakeClock.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

using namespace std::chrono_literals;

constexpr Time start = std::chrono::sys_days{std::chrono::year{2026} / 11 / 16};

struct NamedMoment {
    const char* text;
    std::optional<Time> time;
};

class MomentTextTest : public testing::TestWithParam<NamedMoment> {};

TEST_P(MomentTextTest, IsReadByTheDayThatIsShown) {
    const FakeClock clock; // UTC
    EXPECT_EQ(momentNamed(GetParam().text, start + 5h, clock), GetParam().time) << GetParam().text;
}

INSTANTIATE_TEST_SUITE_P(
    , MomentTextTest,
    testing::Values(NamedMoment{"05:02:40", start + 5h + 2min + 40s}, NamedMoment{"05:02", start + 5h + 2min},
                    NamedMoment{" 5:2:40.25 ", start + 5h + 2min + 40s + 250ms},
                    NamedMoment{"2026-11-17 00:00:01", start + 24h + 1s},
                    NamedMoment{"+90.5", start + 5h + 90s + 500ms}, NamedMoment{"-60", start + 4h + 59min},
                    NamedMoment{"", {}}, NamedMoment{"5", {}}, NamedMoment{"24:00", {}},
                    NamedMoment{"05:60", {}}, NamedMoment{"05:02:60", {}}, NamedMoment{"05:02:4x", {}},
                    NamedMoment{"+", {}}, NamedMoment{"+-1", {}}, NamedMoment{"+1e3", {}},
                    NamedMoment{"2026-13-01 00:00", {}}, NamedMoment{"later", {}}));

TEST(MomentTextZoneTest, TimesAreTheZonesOfTheClock) {
    FakeClock clock;
    clock.setZone({1h, false});
    // 23:30 UTC on the 16th is half past midnight on the 17th.
    EXPECT_EQ(momentNamed("00:45", start + 23h + 30min, clock), start + 23h + 45min);
}

} // namespace
} // namespace velmora

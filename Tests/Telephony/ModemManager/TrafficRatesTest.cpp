// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/Reports/TrafficRates.h"

#include "Tests/Support/FakeClock.h"

#include <gtest/gtest.h>

#include <chrono>
#include <memory>
#include <optional>

namespace velmora {
namespace {

using namespace std::chrono_literals;

/// What a bearer's statistics say; what is absent is not in them.
struct Answer {
    std::optional<std::int64_t> received;
    std::optional<std::int64_t> sent;
    std::optional<std::int64_t> duration;
    std::optional<std::int64_t> start;
};

class TrafficRatesTest : public ::testing::Test {
protected:
    void answer(const Answer& given, std::initializer_list<Dictionary::Entry> more = {}) {
        Dictionary statistics;
        const auto set = [&statistics](const char* name, std::optional<std::int64_t> number) {
            if (number)
                statistics.set(name, *number);
        };
        set("rx-bytes", given.received);
        set("tx-bytes", given.sent);
        set("duration", given.duration);
        set("start-date", given.start);
        Dictionary properties{{"Connected", true}, {"Stats", std::make_shared<Dictionary>(statistics)}};
        for (const Dictionary::Entry& each : more)
            properties.set(each.key, each.value);
        rates.answer(bearer, properties, now);
    }
    /// Of the row; none where there is no row or no rate.
    [[nodiscard]] std::optional<double> rate(const char* key) const {
        const DictionaryRef root = rates.report(Modem(), {bearer});
        const Array* rows = (*root)["kVoxTraffic"].asArray();
        const Dictionary* row = rows->empty() ? nullptr : (*rows)[0].asDictionary();
        const double* value = row ? (*row)[key].asReal() : nullptr;
        return value ? std::optional(*value) : std::nullopt;
    }
    [[nodiscard]] std::optional<double> down() const { return rate("kVoxTrafficDownlinkRate"); }
    [[nodiscard]] std::optional<double> up() const { return rate("kVoxTrafficUplinkRate"); }

    const std::string bearer = "/org/freedesktop/ModemManager1/Bearer/0";
    TrafficRates rates;
    Time now = FakeClock::defaultNow();
};

TEST_F(TrafficRatesTest, areBitsASecond) {
    answer({1000, 2000, 10, 1});
    EXPECT_FALSE(down());
    now += 30s;
    answer({1000 + 375'000, 2000, 40, 1});
    EXPECT_EQ(down(), 100'000); // 375000 * 8 / 30
    EXPECT_EQ(up(), 0);
    EXPECT_EQ(rate("kVoxTrafficInterval"), 30);
}

TEST_F(TrafficRatesTest, aCounterOf32BitsWraps) {
    answer({4'294'967'000, 10, 10, 1});
    now += 10s;
    answer({704, 20, 20, 1}); // 296 to the end of the range, and 704 more
    EXPECT_EQ(down(), 800);   // 1000 * 8 / 10
    EXPECT_EQ(up(), 8);
}

TEST_F(TrafficRatesTest, nothingIsSaidOfACounterThatWasRestarted) {
    answer({1'000'000, 10, 10, 1});
    now += 10s;
    answer({5000, 20, 20, 1});
    EXPECT_FALSE(down()) << "to wrap it would have had to receive nearly 4 GB";
    EXPECT_EQ(up(), 8);
    // Above 32 bits it cannot have wrapped there.
    answer({5'000'000'000, 20, 30, 1});
    now += 10s;
    answer({4'999'999'999, 20, 40, 1});
    EXPECT_FALSE(down());
}

TEST_F(TrafficRatesTest, nothingIsSaidAcrossTwoConnections) {
    answer({1000, 1000, 10, 1});
    now += 10s;
    answer({2000, 2000, 5, 1});
    EXPECT_FALSE(down()) << "it lasts for less long than before";
    now += 10s;
    answer({3000, 3000, 15, 2});
    EXPECT_FALSE(down()) << "it began at another time";
    rates.forget(bearer);
    now += 10s;
    answer({4000, 4000, 25, 2});
    EXPECT_FALSE(down()) << "it was forgotten";
    // Of counters that went back nothing is known where the connection could be another.
    answer({4'294'967'000, 4'294'967'000, {}, {}});
    now += 10s;
    answer({100, 4'294'967'100, {}, {}});
    EXPECT_FALSE(down());
    EXPECT_FALSE(up());
}

TEST_F(TrafficRatesTest, aClockThatWasSetIsNoMeasure) {
    answer({1000, 1000, 10, 1});
    now += 3600s;
    answer({2000, 1000, 20, 1});
    EXPECT_EQ(down(), 800); // 1000 * 8 / 10
    now -= 7200s;
    answer({3000, 1000, 30, 1});
    EXPECT_EQ(down(), 800);
    now -= 7200s;
    answer({4000, 1000, {}, 1});
    EXPECT_FALSE(down()) << "and no duration replaces it";
}

TEST_F(TrafficRatesTest, countersThatAreNotCountedAreLeftOut) {
    answer({0, 0, 10, 1}, {{"ReloadStatsSupported", false}});
    EXPECT_TRUE((*rates.report(Modem(), {bearer}))["kVoxTraffic"].asArray()->empty());
    answer({0, 0, 10, 1}, {{"ReloadStatsSupported", true}});
    EXPECT_FALSE((*rates.report(Modem(), {bearer}))["kVoxTraffic"].asArray()->empty());
    // A counter that is gone at the next answer takes its rate with it.
    now += 10s;
    answer({1000, 1000, 20, 1});
    EXPECT_EQ(up(), 800);
    now += 10s;
    answer({2000, {}, 30, 1});
    EXPECT_EQ(down(), 800);
    EXPECT_FALSE(up());
    answer({{}, {}, 40, 1});
    EXPECT_TRUE((*rates.report(Modem(), {bearer}))["kVoxTraffic"].asArray()->empty());
}

} // namespace
} // namespace velmora

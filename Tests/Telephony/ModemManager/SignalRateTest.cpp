// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/SignalRate.h"

#include "Tests/Telephony/ModemManager/CellsFixture.h"

#include <filesystem>
#include <fstream>

/// The rate at which ModemManager polls the levels: set while a client listens, and put back.

namespace velmora {
namespace {

using namespace std::chrono_literals;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

class SignalRateTest : public CellsFixture {
protected:
    SignalRateTest() {
        modem[Mock::signal] = {{"Rate", 0U}};
        mock.answers["Setup"] = {{}, {}, {}};
        mock.setsRates = true;
    }

    void begin() {
        mock.put(Mock::modemPath(0), modem);
        follow();
        listen();
    }
    /// The rates that Setup was called with.
    std::vector<uint> rates() const {
        std::vector<uint> set;
        for (const Mock::Call& call : mock.calls)
            if (call.member == "Setup") {
                EXPECT_EQ(call.path, Mock::modemPath(0));
                EXPECT_EQ(call.arguments.size(), 1);
                set.push_back(call.arguments.value(0).toUInt());
            }
        return set;
    }
    [[nodiscard]] bool haveBeenSet(std::size_t count) {
        return comes([&] { return rates().size() == count; });
    }
    void changeRate(uint rate) {
        mock.change(Mock::modemPath(0), Mock::signal, {{"Rate", rate}});
        drain();
    }

    InterfaceMap modem = testModem(lteAccess);
};

TEST_F(SignalRateTest, isSetAndPutBack) {
    begin();
    ASSERT_TRUE(haveBeenSet(1));
    drain();
    queue.advance(1h);
    source->stop();
    ASSERT_TRUE(haveBeenSet(2));
    EXPECT_THAT(rates(), ElementsAre(5U, 0U));
}

TEST_F(SignalRateTest, aSlowerForeignRateIsRestoredAndAFasterOneKept) {
    modem[Mock::signal] = {{"Rate", 30U}};
    begin();
    ASSERT_TRUE(haveBeenSet(1));
    drain();
    source->stop();
    ASSERT_TRUE(haveBeenSet(2));
    changeRate(2);
    listen();
    ASSERT_TRUE(passes([this] { return mock.count("GetCellInfo") == 3; }));
    source->stop();
    drain();
    EXPECT_THAT(rates(), ElementsAre(5U, 30U));
}

TEST_F(SignalRateTest, aRateThatAnotherProgramHasSetSinceStays) {
    begin();
    ASSERT_TRUE(haveBeenSet(1));
    drain();
    changeRate(2);
    source->stop();
    drain();
    EXPECT_THAT(rates(), ElementsAre(5U));
    EXPECT_FALSE(std::filesystem::exists(directory / RateMemory::fileName));
}

TEST_F(SignalRateTest, oneThatIsSlowerAgainIsSetAtMostOnceAMinute) {
    begin();
    ASSERT_TRUE(haveBeenSet(1));
    drain();
    changeRate(0);
    changeRate(20);
    queue.advance(55s);
    drain();
    EXPECT_THAT(rates(), ElementsAre(5U));
    queue.advance(6s);
    ASSERT_TRUE(haveBeenSet(2));
    drain();
    source->stop();
    ASSERT_TRUE(haveBeenSet(3));
    EXPECT_THAT(rates(), ElementsAre(5U, 5U, 20U));
}

TEST_F(SignalRateTest, isSetOnceTheModemHasLevels) {
    modem.remove(Mock::signal);
    begin();
    drain();
    EXPECT_THAT(rates(), IsEmpty());
    mock.put(Mock::modemPath(0), {{Mock::signal, {{"Rate", 0U}}}});
    ASSERT_TRUE(haveBeenSet(1));
    mock.removeInterface(Mock::modemPath(0), Mock::signal);
    drain();
    mock.put(Mock::modemPath(0), {{Mock::signal, {{"Rate", 0U}}}});
    ASSERT_TRUE(haveBeenSet(2));
    source.reset();
    ASSERT_TRUE(haveBeenSet(3));
    EXPECT_THAT(rates(), ElementsAre(5U, 5U, 0U));
}

TEST_F(SignalRateTest, isPutBackAfterACrash) {
    modem[Mock::signal] = {{"Rate", 30U}};
    begin();
    ASSERT_TRUE(haveBeenSet(1));
    drain();
    // A crash leaves the file, which an orderly end removes.
    const std::filesystem::path file = directory / RateMemory::fileName;
    ASSERT_TRUE(std::filesystem::exists(file));
    const std::filesystem::path kept = directory / "kept";
    std::filesystem::copy_file(file, kept);
    source.reset();
    ASSERT_TRUE(haveBeenSet(2));
    drain();
    EXPECT_FALSE(std::filesystem::exists(file));
    changeRate(5);

    std::filesystem::copy_file(kept, file);
    follow();
    ASSERT_TRUE(haveBeenSet(3));
    EXPECT_THAT(rates(), ElementsAre(5U, 30U, 30U));
    EXPECT_FALSE(std::filesystem::exists(file));

    // Another program's rate, another ModemManager's modem, and a damaged file are left alone.
    changeRate(7);
    std::filesystem::copy_file(kept, file);
    follow();
    drain();
    changeRate(5);
    for (const char* text : {":0.0\n/org/freedesktop/ModemManager1/Modem/0\n5\n30\n", "x", ""}) {
        std::ofstream(file) << text;
        follow();
        drain();
    }
    EXPECT_EQ(rates().size(), 3U);
}

TEST(RateMemoryTest, readsWhatItWrote) {
    const TemporaryDirectory directory;
    const RateMemory memory(directory.path());
    EXPECT_FALSE(memory.read());
    const RememberedRate rate{":1.5", "/org/freedesktop/ModemManager1/Modem/0", 5, 30};
    memory.write(rate);
    EXPECT_EQ(memory.read(), rate);
    memory.clear();
    EXPECT_FALSE(memory.read());
    const RateMemory nowhere{std::filesystem::path()};
    nowhere.write(rate);
    EXPECT_FALSE(nowhere.read());
}

} // namespace
} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Watch/WatchModel.h"

#include "PropertyLists/PropertyList.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeMainQueue.h"
#include "Tests/Support/FakeMessagePorts.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Support/FakeTelephonyService.h"
#include "Tests/Tools/ToolFixture.h"

#include <gtest/gtest.h>

#include <chrono>
#include <optional>

namespace velmora {
namespace {

using namespace std::chrono_literals;

/// The model of a watcher on fake ports in virtual time, with a service that names its technology.
class WatchModelTest : public testing::TestWithParam<std::string_view>, public ModelObserver {
protected:
    static constexpr const char* localName = "com.velmora.test.watch";

    WatchModelTest() {
        for (const char* technology : {"Ostrel_GSM", "C2KTemplate"})
            _resources.put(technology, "plist", Value(makeDictionary()));
        _ports.serve("com.velmora.test.channel", [](std::int32_t, const Data&, bool wantsReply) {
            if (!wantsReply)
                return RemotePort::Answer{};
            const DictionaryRef answer = makeDictionary();
            answer->set("GetTechnology", GetParam());
            return RemotePort::Answer{PortStatus::Success, serialized(answer)};
        });
    }

    void updateViewControllerFromModel() override {
        _lastDisplay = _model->topLevelNodes();
        ++_redraws;
    }

    FakeClock _clock;
    FakeMainQueue _queue{_clock};
    FakeMessagePorts _ports;
    FakeTelephonyService _telephony;
    FakeResources _resources;
    DecoderLines _lines{false};
    NodeRef _lastDisplay;
    int _redraws = 0;
    std::shared_ptr<WatchModel> _model =
        std::make_shared<WatchModel>(ModelPlatform{_ports, _queue, _telephony, _clock,
                                                   [] { return std::optional<std::string>(localName); }},
                                     this, _lines, WatchModel::Events{[](std::string_view) {}});
};

INSTANTIATE_TEST_SUITE_P(Technologies, WatchModelTest,
                         testing::Values(kVoxLogChannelTechnology_IFX, kVoxLogChannelTechnology_Ostrel_GSM,
                                         kVoxLogChannelTechnology_Ostrel_CDMA),
                         [](const auto& each) { return std::string(shortTechnologyName(each.param)); });

TEST_P(WatchModelTest, NoRefreshIsKept) {
    const bool isIFX = GetParam() == kVoxLogChannelTechnology_IFX;
    const Data message = isIFX ? serialized(makeDictionary()) : rrState(5);
    _model->startMonitor();
    for (int refresh = 1; refresh <= 7; ++refresh) {
        ASSERT_TRUE(_ports.deliver(localName, 0, message));
        _queue.advance(2s);
        ASSERT_EQ(_redraws, refresh);
        EXPECT_NE(_lastDisplay, nullptr);
        EXPECT_FALSE(_model->state().contains("History"));
        // The raw messages of a refresh are kept for the history alone; IFX's is its display's own object.
        EXPECT_EQ(_model->state().contains("DisplayState"), isIFX);
    }
}

} // namespace
} // namespace velmora

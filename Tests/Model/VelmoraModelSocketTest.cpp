// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Model/VelmoraModel.h"
#include "Platform/Linux/MainLoop.h"
#include "Platform/Linux/Ports/LinuxMessagePorts.h"
#include "Platform/Linux/Ports/LinuxTelephonyService.h"
#include "Platform/Linux/QtMainQueue.h"
#include "Tests/Model/SocketService.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <chrono>
#include <memory>
#include <string>
#include <string_view>

// The model against a service in another process, over real sockets. Refreshes and retries come fifty times
// as fast as on the device; the commands' time-outs are the real ones.

namespace velmora {
namespace {

using namespace std::chrono_literals;

MainLoop* loop = nullptr;

class QuickQueue final : public MainQueue {
public:
    void async(Task task) override { _queue.async(std::move(task)); }
    void after(std::chrono::nanoseconds delay, Task task) override {
        _queue.after(delay / 50, std::move(task));
    }
    std::unique_ptr<Timer> repeating(std::chrono::nanoseconds interval, Task action) override {
        return _queue.repeating(interval / 50, std::move(action));
    }

private:
    QtMainQueue _queue;
};

class VelmoraModelSocketTest : public testing::Test, public ModelObserver {
protected:
    VelmoraModelSocketTest() {
        resources.put("Ostrel_GSM", "plist",
                      Value(std::make_shared<Dictionary>(
                          std::initializer_list<Dictionary::Entry>{{"Process CS", makeDictionary()}})));
    }

    void updateViewControllerFromModel() override {
        ++redraws;
        static_cast<void>(model->topLevelNodes());
    }

    [[nodiscard]] std::shared_ptr<VelmoraModel> makeModel(ModelObserver* observer) {
        return std::make_shared<VelmoraModel>(
            ModelPlatform{ports, queue, telephony, clock, [] { return std::optional(logChannelPortName()); }},
            observer);
    }
    [[nodiscard]] std::string directory() const { return (temporary / ".").string(); }
    [[nodiscard]] static bool eventually(const std::function<bool()>& condition) {
        return loop->runUntil(condition, 20s);
    }
    [[nodiscard]] bool logged(std::string_view text) const { return log.contains(LogPriority::Error, text); }
    [[nodiscard]] bool isShown() const {
        const NodeRef node = model->nodeAtPath("/Process CS/MM Service State");
        return node && *node->value() == "REG_STATE_IDLE";
    }
    [[nodiscard]] PortOptions options() const {
        PortOptions made;
        made.directory = directory();
        return made;
    }

    CapturedLog log;
    TemporaryDirectory temporary;
    FakeClock clock;
    FakeResources resources;
    QuickQueue queue;
    LinuxMessagePorts ports{options()};
    LinuxTelephonyService telephony{ports};
    int redraws = 0;
    std::shared_ptr<VelmoraModel> model = makeModel(this);
};

TEST_F(VelmoraModelSocketTest, ServiceThatAppearsLaterIsFound) {
    model->restartMonitor();
    EXPECT_FALSE(model->isConnected());
    EXPECT_TRUE(logged("Could not create VoxServerConnection"));
    const SocketService service(directory(), "normal");
    ASSERT_TRUE(eventually([this] { return redraws > 0; }));
    EXPECT_TRUE(model->isConnected());
    EXPECT_TRUE(isShown());
}

TEST_F(VelmoraModelSocketTest, ServiceKilledWhileStreamingIsNoticedAndFoundAgain) {
    auto service = std::make_unique<SocketService>(directory(), "normal");
    model->restartMonitor();
    ASSERT_TRUE(eventually([this] { return redraws > 1; }));
    const Dictionary* display = model->state()["Display"].asDictionary();
    const std::size_t history = model->state()["History"].asArray()->size();

    service->kill();
    ASSERT_TRUE(eventually([this] { return !model->isConnected(); }));
    EXPECT_TRUE(isShown()); // what was shown stays
    EXPECT_GE(model->state()["History"].asArray()->size(), history);

    service = std::make_unique<SocketService>(directory(), "normal");
    ASSERT_TRUE(eventually([this] { return model->isConnected(); }));
    const int before = redraws; // a redraw that was due when the service died may be among these
    ASSERT_TRUE(eventually([this, before] { return redraws > before + 1; }));
    EXPECT_EQ(model->state()["Display"].asDictionary(), display);
    EXPECT_TRUE(isShown());
}

TEST_F(VelmoraModelSocketTest, SecondApplicationOnTheSameNameWaitsForTheFirstToEnd) {
    const SocketService service(directory(), "normal");
    model->restartMonitor();
    ASSERT_TRUE(model->isConnected());
    const auto second = makeModel(nullptr);
    second->restartMonitor();
    EXPECT_FALSE(second->isConnected());
    EXPECT_TRUE(logged("Local messsage port already exists"));
    const int before = redraws;
    ASSERT_TRUE(eventually([this, before] { return redraws > before; })); // the first goes on
    model.reset();
    ASSERT_TRUE(eventually([&second] { return second->isConnected(); }));
}

struct Manner {
    const char* name;
    const char* manner;
    const char* line;
};

class OddServiceTest : public VelmoraModelSocketTest, public testing::WithParamInterface<Manner> {};

TEST_P(OddServiceTest, IsReportedAndTriedAgainUntilItAnswersWell) {
    {
        const SocketService odd(directory(), GetParam().manner);
        model->restartMonitor();
        EXPECT_TRUE(logged(GetParam().line)) << testing::PrintToString(log.textsAt(LogPriority::Error));
        EXPECT_TRUE(logged("No log generator technology works"));
        EXPECT_FALSE(model->isConnected());
    }
    const SocketService good(directory(), "normal");
    ASSERT_TRUE(eventually([this] { return redraws > 0; }));
    EXPECT_TRUE(isShown());
}

INSTANTIATE_TEST_SUITE_P(
    , OddServiceTest,
    testing::Values(
        Manner{"Late", "late", " ***** Could not send the GetTechnology command (got error=-2)"},
        Manner{"Rubbish", "rubbish", " ***** Could not parse reply to GetTechnology; cannot configure"},
        Manner{"UnknownTechnology", "unknown", "Got log generated: (nil)"},
        Manner{"NoAnswer", "no-answer", " ***** Reply to GetTechnology had no answer; cannot configure"},
        Manner{"NoData", "no-data", " ***** No response to GetTechnology; cannot configure"}),
    [](const auto& test) { return std::string(test.param.name); });

TEST_F(VelmoraModelSocketTest, NothingIsLeftInTheDirectory) {
    {
        const SocketService service(directory(), "normal");
        model->restartMonitor();
        ASSERT_TRUE(model->isConnected());
        EXPECT_TRUE(std::filesystem::exists(temporary / logChannelPortName()));
    }
    model.reset();
    EXPECT_FALSE(std::filesystem::exists(temporary / logChannelPortName()));
}

} // namespace
} // namespace velmora

int main(int argc, char** argv) {
    if (argc == 4 && std::string_view(argv[1]) == "--service")
        return velmora::SocketService::main(argv[2], argv[3]);
    testing::InitGoogleMock(&argc, argv);
    velmora::MainLoop own;
    velmora::loop = &own;
    return RUN_ALL_TESTS();
}

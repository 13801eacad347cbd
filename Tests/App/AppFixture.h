// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "App/VelmoraApp.h"
#include "App/VelmoraCell.h"
#include "App/VelmoraPaneController.h"
#include "App/VelmoraSaveViewController.h"
#include "Platform/Linux/Files/LinuxFileSystem.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeMainQueue.h"
#include "Tests/Support/FakeMessagePorts.h"
#include "Tests/Support/FakePreferences.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Support/FakeTelephonyService.h"
#include "Tests/Support/TemporaryDirectory.h"
#include "Toolkit/Navigation/NavigationController.h"
#include "Toolkit/Tables/TableView.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

class QWidget;

namespace velmora {

/// The application's platform in a test: fakes in virtual time, and files in a directory of the test's.
class TestAppPlatform final : public AppPlatform {
public:
    explicit TestAppPlatform(const LinuxFileSystem::Options& options) : linuxFiles(options) {}

    [[nodiscard]] ModelPlatform model() override {
        return {ports, queue, telephony, clock, [] { return std::optional(logChannelPortName()); }};
    }
    [[nodiscard]] FileSystem& files() override { return linuxFiles; }
    [[nodiscard]] Preferences& preferences() override { return fakePreferences; }
    [[nodiscard]] std::vector<RuleFile> ruleFiles() override { return rules; }

    FakeClock clock;
    FakeMainQueue queue{clock};
    FakeMessagePorts ports;
    FakeTelephonyService telephony;
    FakePreferences fakePreferences;
    LinuxFileSystem linuxFiles;
    std::vector<RuleFile> rules;
};

/// The application on the real toolkit, with a service that the test plays. The service speaks the technology
/// whose messages are the displays themselves, unless the test sets another.
class AppFixture : public testing::Test {
protected:
    static constexpr const char* channelName = "com.velmora.test.channel";
    static constexpr const char* marker = "QuorraInternal/Library/PreferenceBundles/Carrier Settings.bundle";

    AppFixture();
    ~AppFixture() override;

    /// The screens come up; the model has not been started yet.
    void launch();
    /// Launches and lets the model connect.
    void launchAndConnect();
    /// The service sends this display, and the next tick redraws.
    void show(const Value& display);
    /// The service is gone, and the next tick finds that out.
    void loseService();
    /// Serves events until the condition holds; false after twenty seconds.
    bool eventually(const std::function<bool()>& condition);
    /// Serves the events that are there.
    void runUntilIdle();

    [[nodiscard]] static Value dictionary(std::initializer_list<Dictionary::Entry> entries) {
        return Value(std::make_shared<Dictionary>(entries));
    }
    [[nodiscard]] static Data bytes(const Value& display);

    [[nodiscard]] std::size_t depth() const { return app.navController().viewControllers().size(); }
    /// From the bottom of the stack.
    [[nodiscard]] std::shared_ptr<VelmoraPaneController> pane(std::size_t index) const;
    [[nodiscard]] std::shared_ptr<VelmoraPaneController> topPane() const { return pane(depth() - 1); }
    [[nodiscard]] std::shared_ptr<VelmoraSaveViewController> saveScreen() const;

    /// What a pane's toolbar shows.
    [[nodiscard]] static std::string status(const VelmoraPaneController& pane);
    [[nodiscard]] static bool isSpinning(const VelmoraPaneController& pane);
    [[nodiscard]] static bool offersSave(const VelmoraPaneController& pane);

    [[nodiscard]] static std::shared_ptr<VelmoraCell> cell(VelmoraPaneController& pane, std::size_t row);
    /// A pane's rows as they are on the screen: "name" for a cell without a value label, else "name: value".
    [[nodiscard]] static std::vector<std::string> rows(VelmoraPaneController& pane);

    /// Clicks the middle of a view, or a place in it, with a real mouse press and release in its window.
    void click(QWidget* widget);
    void click(QWidget* widget, double x, double y);
    void clickRow(TableView& table, std::size_t row);
    void clickRow(std::size_t row) { clickRow(topPane()->tableView(), row); }
    /// The widgets that are seen and whose text or accessible name is this.
    [[nodiscard]] static std::vector<QWidget*> shownWidgets(const std::string& text);
    /// The title above the panes, by the widgets that show it.
    [[nodiscard]] static bool isShown(const std::string& text) { return !shownWidgets(text).empty(); }

    CapturedLog log;
    FakeResources resources;
    TemporaryDirectory directory; ///< the system root; snapshots go to "logs" in it, which is there
    std::string technology = std::string(kVoxLogChannelTechnology_IFX);

private:
    TestAppPlatform* _platform = nullptr;
    int _count = 1;
    char _name[8] = "velmora";
    char* _arguments[2] = {_name, nullptr};

protected:
    VelmoraApp app;
    TestAppPlatform& platform;
};

} // namespace velmora

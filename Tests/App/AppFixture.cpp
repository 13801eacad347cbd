// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/App/AppFixture.h"

#include "PropertyLists/PropertyList.h"
#include "Toolkit/Bars/LabelItem.h"
#include "Toolkit/Bars/SaveButton.h"
#include "Toolkit/BusyIndicator.h"

#include <QApplication>
#include <QLabel>
#include <QPushButton>
#include <QTest>
#include <QToolButton>
#include <QWidget>
#include <QWindow>

#include <chrono>
#include <filesystem>

namespace velmora {

using namespace std::chrono_literals;

namespace {

template <class Item>
std::shared_ptr<Item> itemOf(const VelmoraPaneController& pane) {
    for (const auto& item : pane.toolbarItems())
        if (auto found = std::dynamic_pointer_cast<Item>(item))
            return found;
    return nullptr;
}

QString textOf(const QWidget* widget) {
    if (const auto* label = qobject_cast<const QLabel*>(widget))
        return label->text();
    if (const auto* button = qobject_cast<const QAbstractButton*>(widget))
        return button->text();
    return {};
}

} // namespace

AppFixture::AppFixture()
    : app(_count, _arguments,
          [this] {
              std::filesystem::create_directory(directory / "logs");
              auto made = std::make_unique<TestAppPlatform>(
                  LinuxFileSystem::Options{directory.path(), directory / "logs"});
              _platform = made.get();
              return made;
          }),
      platform(*_platform) {
    platform.ports.serve(channelName, [this](std::int32_t, const Data&, bool wantsReply) {
        RemotePort::Answer answer;
        answer.status = PortStatus::Success;
        if (wantsReply)
            answer.reply = bytes(dictionary({{"GetTechnology", technology}}));
        return answer;
    });
}

AppFixture::~AppFixture() = default;

Data AppFixture::bytes(const Value& display) {
    const auto text = writeXMLPropertyList(display);
    return Data(std::vector<std::uint8_t>(text->begin(), text->end()));
}

void AppFixture::launch() {
    app.applicationDidFinishLaunching(app);
    runUntilIdle();
}

void AppFixture::launchAndConnect() {
    launch();
    platform.queue.runPending();
    runUntilIdle(); // the window is painted
    ASSERT_TRUE(app.model().isConnected());
}

void AppFixture::show(const Value& display) {
    ASSERT_TRUE(platform.ports.deliver(logChannelPortName(), 0, bytes(display)));
    platform.queue.advance(2s);
    runUntilIdle();
}

void AppFixture::loseService() {
    platform.telephony.available = false;
    platform.ports.sever(channelName);
    platform.queue.advance(2s);
    runUntilIdle();
}

bool AppFixture::eventually(const std::function<bool()>& condition) {
    return app.runUntil(condition, 20s);
}

void AppFixture::runUntilIdle() {
    for (int i = 0; i < 5; ++i)
        QApplication::processEvents();
}

std::shared_ptr<VelmoraPaneController> AppFixture::pane(std::size_t index) const {
    return std::dynamic_pointer_cast<VelmoraPaneController>(app.navController().viewControllers().at(index));
}

std::shared_ptr<VelmoraSaveViewController> AppFixture::saveScreen() const {
    return std::dynamic_pointer_cast<VelmoraSaveViewController>(app.navController().modalViewController());
}

std::string AppFixture::status(const VelmoraPaneController& pane) {
    const auto label = itemOf<LabelItem>(pane);
    return label ? label->text() : "(no label)";
}

bool AppFixture::isSpinning(const VelmoraPaneController& pane) {
    const auto indicator = itemOf<BusyIndicator>(pane);
    return indicator && indicator->isAnimating();
}

bool AppFixture::offersSave(const VelmoraPaneController& pane) {
    return itemOf<SaveButton>(pane) != nullptr;
}

std::shared_ptr<VelmoraCell> AppFixture::cell(VelmoraPaneController& pane, std::size_t row) {
    return std::dynamic_pointer_cast<VelmoraCell>(pane.tableView().cellForRow(IndexPath(0, row)));
}

std::vector<std::string> AppFixture::rows(VelmoraPaneController& pane) {
    std::vector<std::string> texts;
    for (const IndexPath& path : pane.tableView().indexPathsForVisibleRows()) {
        const auto shown = cell(pane, path.row());
        texts.push_back(shown->key().text() + (shown->value() ? ": " + shown->value()->text() : ""));
    }
    return texts;
}

void AppFixture::click(QWidget* widget) {
    click(widget, widget->width() / 2.0, widget->height() / 2.0);
}

void AppFixture::click(QWidget* widget, double x, double y) {
    QWidget* window = widget->window();
    const QPoint place = widget->mapTo(window, QPoint(static_cast<int>(x), static_cast<int>(y)));
    QTest::mouseClick(window->windowHandle(), Qt::LeftButton, {}, place);
    runUntilIdle();
}

void AppFixture::clickRow(TableView& table, std::size_t row) {
    const Rect place = table.rectForRow(IndexPath(0, row));
    click(table.widget(), place.x + place.width / 2, place.y + place.height / 2);
}

std::vector<QWidget*> AppFixture::shownWidgets(const std::string& text) {
    std::vector<QWidget*> found;
    const QString wanted = QString::fromStdString(text);
    for (QWidget* widget : QApplication::allWidgets())
        if (widget->isVisible() && (textOf(widget) == wanted || widget->accessibleName() == wanted))
            found.push_back(widget);
    return found;
}

} // namespace velmora

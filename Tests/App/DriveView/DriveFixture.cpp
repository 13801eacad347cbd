// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/App/DriveView/DriveFixture.h"

#include "Platform/Resources.h"
#include "Telephony/Sources/SourceFactory.h"
#include "Tests/Support/ShippedResources.h"

#include <QDir>
#include <QLabel>
#include <QPixmap>
#include <QTest>
#include <QWidget>
#include <QWindow>

#include <chrono>

namespace velmora {

DriveFixture::DriveFixture() {
    setResources(&_files);
    technology = kVoxLogChannelTechnology_Ostrel_GSM;
    for (const char* const name : {"rules/classes.toml", "rules/coverage.toml", "rules/transfer.toml"}) {
        const Data rules = shippedResource(name);
        platform.rules.push_back({name, std::string(rules.bytes().begin(), rules.bytes().end()), 0, true});
    }
}

DriveFixture::~DriveFixture() {
    if (_source)
        _source->stop();
    setResources(&resources);
}

void DriveFixture::receive(const Data& message) {
    static_cast<void>(platform.ports.deliver(logChannelPortName(), 0, message));
}

void DriveFixture::launchIn(int width, int height) {
    launch();
    resize(width, height);
    platform.queue.runPending();
    runUntilIdle();
    ASSERT_TRUE(app.model().isConnected());
}

void DriveFixture::resize(int width, int height) {
    window()->resize(width, height);
    runUntilIdle();
}

void DriveFixture::drive(int seconds) {
    if (!_source) {
        const auto choice = parseSource("scenario:gsm,seed=1");
        ASSERT_TRUE(choice);
        auto source = makeSource(*choice, platform.queue, platform.clock);
        ASSERT_TRUE(source);
        _source = std::move(*source);
        _source->start(*this);
    }
    platform.queue.advance(std::chrono::seconds(seconds));
    runUntilIdle();
}

void DriveFixture::wait(int seconds) {
    if (_source)
        _source->stop();
    platform.queue.advance(std::chrono::seconds(seconds));
    runUntilIdle();
}

QWidget* DriveFixture::window() const {
    return app.navController().view().widget()->window();
}

std::vector<QLabel*> DriveFixture::labels() const {
    std::vector<QLabel*> found;
    for (QLabel* const each : view().widget()->findChildren<QLabel*>())
        if (each->isVisible())
            found.push_back(each);
    return found;
}

std::vector<std::string> DriveFixture::texts() const {
    std::vector<std::string> found;
    for (const QLabel* const each : labels())
        found.push_back(each->text().toStdString());
    return found;
}

void DriveFixture::press(int key, Qt::KeyboardModifiers modifiers) {
    QTest::keyClick(window()->windowHandle(), static_cast<Qt::Key>(key), modifiers);
    runUntilIdle();
}

void DriveFixture::shoot(const std::string& name) const {
    QDir().mkpath(VELMORA_BUILD_DIR "/screenshots");
    const std::string file = VELMORA_BUILD_DIR "/screenshots/drive-" + name + ".png";
    EXPECT_TRUE(window()->grab().save(QString::fromStdString(file))) << file;
}

} // namespace velmora

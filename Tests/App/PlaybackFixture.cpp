// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/App/PlaybackFixture.h"

#include "Recording/Pcapng/PcapngWriter.h"

#include <QLabel>
#include <QTest>
#include <QWidget>

#include <stdexcept>

namespace velmora {

std::string PlaybackFixture::write(const std::string& name, const std::vector<Arrival>& arrivals) const {
    const std::string path = (directory / name).string();
    const auto writer = PcapngWriter::create(path, "IFX");
    if (!writer)
        throw std::runtime_error(writer.reason());
    for (const auto& [milliseconds, display] : arrivals)
        if (const auto done = (*writer)->append(
                FakeClock::defaultNow() + std::chrono::milliseconds(milliseconds), bytes(display).bytes());
            !done)
            throw std::runtime_error(done.reason());
    if (const auto closed = (*writer)->close(); !closed)
        throw std::runtime_error(closed.reason());
    return path;
}

void PlaybackFixture::openPaused(const std::string& path) {
    app.setRecording(path, {});
    launch();
    platform.queue.runPending();
    runUntilIdle(); // the window is painted
    ASSERT_NE(app.playback(), nullptr);
    app.playback()->pause();
    ASSERT_TRUE(app.playback()->index().isComplete());
    runUntilIdle();
}

void PlaybackFixture::press(int key) {
    QTest::keyClick(window()->windowHandle(), static_cast<Qt::Key>(key));
    runUntilIdle();
}

void PlaybackFixture::pass(std::chrono::milliseconds time) {
    platform.queue.advance(time);
    runUntilIdle();
}

QWidget* PlaybackFixture::part(const char* name) const {
    return window()->findChild<QWidget*>(name);
}

QWidget* PlaybackFixture::window() const {
    return topPane()->view().widget()->window();
}

std::string PlaybackFixture::shownBand() const {
    for (const std::string& row : rows(*pane(0)))
        if (row.starts_with("Band: "))
            return row.substr(6);
    return "(none)";
}

std::string PlaybackFixture::shownNotice() const {
    const auto* const label = qobject_cast<QLabel*>(part("velmora.notice"));
    return label && label->isVisible() ? label->text().toStdString() : "";
}

} // namespace velmora

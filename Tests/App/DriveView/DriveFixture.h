// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "App/DriveView/DriveScreen.h"
#include "App/DriveView/DriveView.h"
#include "Platform/Linux/Files/FileResources.h"
#include "Telephony/Sources/LogSource.h"
#include "Tests/App/AppFixture.h"

#include <Qt>

#include <memory>
#include <string>
#include <vector>

class QLabel;

namespace velmora {

/// The application with the drive view during a synthetic drive, in windows of several sizes.
class DriveFixture : public AppFixture, public LogSink {
protected:
    DriveFixture();
    ~DriveFixture() override;

    void receive(const Data& message) override;
    [[nodiscard]] bool hasRoom() const override { return true; }

    /// Launches in a window of that size and lets the model connect.
    void launchIn(int width, int height);
    void resize(int width, int height);
    /// Messages of the drive for so many seconds.
    void drive(int seconds);
    /// Time without messages.
    void wait(int seconds);

    [[nodiscard]] QWidget* window() const;
    [[nodiscard]] DriveModel& model() const { return app.drive().model(); }
    [[nodiscard]] DriveView& view() const { return app.drive().controller().driveView(); }
    /// The texts of all labels of the view.
    [[nodiscard]] std::vector<std::string> texts() const;
    [[nodiscard]] std::vector<QLabel*> labels() const;
    void press(int key, Qt::KeyboardModifiers modifiers = Qt::NoModifier);
    /// Into "screenshots" of the build directory.
    void shoot(const std::string& name) const;

private:
    FileResources _files;
    std::unique_ptr<LogSource> _source;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/DriveView/DriveScreen.h"
#include "App/MaskingModel.h"
#include "App/Playback/PlaybackController.h"
#include "App/Recording/RecordingSwitch.h"
#include "App/Report/ReportSwitch.h"
#include "App/VelmoraApp.h"
#include "App/VelmoraPaneController.h"
#include "Platform/PrintableText.h"
#include "Platform/SystemLog.h"
#include "Toolkit/Alert.h"
#include "Toolkit/Folder.h"
#include "Toolkit/Navigation/NavigationController.h"

#include <utility>
#include <vector>

// What the application does with recordings: those that are shown, and the one that is made.

namespace velmora {

void VelmoraApp::makeRecordingSwitch() {
    _recording = std::make_unique<RecordingSwitch>(
        *_platform, [this] { showBars(); }, [this] { updateNotice(); },
        [this](const std::string& text) { _drive->model().noted(text); });
    _report =
        std::make_unique<ReportSwitch>(*_platform, ReportSwitch::Host{[this] { updateNotice(); }, openPage});
    const auto model = std::make_shared<MaskingModel>(_platform->model(), this, *_privacy);
    model->setOnShown([this](const Data& message) {
        if (_recording)
            _recording->take(message);
    });
    _model = model;
}

void VelmoraApp::setDriveActions() {
    _drive->controller().setActions(
        {[this] { _recording->toggle(_model->technology(), _model->isConnected()); },
         [this] { _recording->bookmark(); }, [this] { askReport(); }, [this] { return _recording->isOn(); }});
}

void VelmoraApp::askReport() {
    if (!_model) // shut down
        return;
    PlayedDecoder::Masking masking;
    if (_privacy->isOn())
        masking = [this](const LoggedMessage& message, std::string_view shown) {
            return _privacy->shown(message.message, shown, message.time);
        };
    _report->ask(_playback ? _playback->path() : _recording->file(), std::move(masking));
}

void VelmoraApp::showBars() {
    std::vector<View*> bars;
    if (_playback)
        bars.push_back(&_playback->bar());
    if (RecordingBar* const bar = _recording->bar())
        bars.push_back(bar);
    _navController->setAccessories(std::move(bars));
    _drive->controller().recordingChanged();
}

void VelmoraApp::openRecording(const std::string& path, const std::string& technology) {
    if (!_model) // shut down
        return;
    Result<std::unique_ptr<PlaybackController>> opened =
        PlaybackController::open(_platform->model(), path, technology,
                                 {[this] { showMoment(); }, [this] { updateNotice(); },
                                  [this](const LoggedMessage& message, std::string_view shown) {
                                      return _privacy->shown(message.message, shown, message.time);
                                  },
                                  [this] { return _platform->ruleFiles(); }});
    if (!opened) {
        const std::string reason = path + ": " + opened.reason();
        logLine(LogPriority::Error, reason);
        Alert("Recording", printable(reason), "Close").show();
        return;
    }
    _endsOnceSaved = false;
    closeSaveView();
    _navController->setAccessories({});
    const std::unique_ptr<PlaybackController> earlier = std::exchange(_playback, *std::move(opened));
    _drive->setRecorded(&_playback->drive());
    clearPanes();
    showBars();
    showMoment();
    updateNotice();
}

void VelmoraApp::closeRecording() {
    if (!_playback)
        return;
    closeSaveView();
    _navController->setAccessories({});
    _drive->setRecorded(nullptr);
    _playback.reset();
    showBars();
    clearPanes();
    if (std::exchange(_recordingPath, {}).empty())
        updateViewControllerFromModel(); // which has gone on
    else
        connectFirst();
    updateNotice();
}

void VelmoraApp::showMoment() {
    if (!_playback) // it is being opened
        return;
    const std::optional<Time> moment = _playback->moment();
    std::string status = moment ? _dateFormatter->stringFromDate(*moment) : "At the start";
    if (const std::string progress = _playback->progress(); !progress.empty())
        status += ", " + progress;
    setUpdateMessage(std::move(status));
    redraw();
    // While it plays the drive view follows in steps of its own.
    if (!_playback->isPlaying())
        _drive->showMoment();
}

} // namespace velmora

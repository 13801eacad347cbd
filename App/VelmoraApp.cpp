// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/VelmoraApp.h"

#include "App/DriveView/DriveScreen.h"
#include "App/MaskingModel.h"
#include "App/Playback/PlaybackController.h"
#include "App/Recording/RecordingSwitch.h"
#include "App/Report/ReportSwitch.h"
#include "App/VelmoraPaneController.h"
#include "App/VelmoraSaveViewController.h"
#include "Model/NodePath.h"
#include "Platform/SystemLog.h"
#include "Toolkit/Alert.h"
#include "Toolkit/Navigation/NavigationController.h"
#include "Toolkit/Navigation/SplitController.h"
#include "Toolkit/Screen.h"
#include "Toolkit/Window.h"

#include <chrono>
#include <cstddef>
#include <utility>
#include <vector>

namespace velmora {

namespace {

constexpr const char* internalInstallMarker =
    "/QuorraInternal/Library/PreferenceBundles/Carrier Settings.bundle";
constexpr const char* homeScreenDomain = "com.velmora.HomeScreen";
constexpr const char* showGSMRSSIKey = "LantheShowGSMRSSI";
constexpr const char* connecting = "Connecting...";
/// How long a notice names a snapshot: time enough to read a path, and to hear it read.
constexpr std::chrono::seconds snapshotNoticeTime{60};
constexpr const char* maskedNotice = "Identities are masked. Ctrl-M shows them.";

} // namespace

VelmoraApp::VelmoraApp(int& argc, char** argv, const PlatformMaker& makePlatform)
    : Application(argc, argv), _platform(makePlatform()) {
    setName("Velmora", "com.velmora.velmora");
}

VelmoraApp::~VelmoraApp() {
    // A retry that is due holds the model beyond this; the ports do not stay open for it.
    if (_navController)
        _navController->setAccessories({});
    if (!_model)
        return;
    _model->destroyPorts();
    _model->setDrive(nullptr);
}

void VelmoraApp::applicationDidFinishLaunching(Application&) {
    getSaveButtonPref();
    _window = std::make_shared<Window>(Screen::mainBounds());
    _privacy = std::make_unique<PrivacySwitch>(_platform->preferences(), _maskKey);
    makeRecordingSwitch();
    _drive = std::make_unique<DriveScreen>(*_platform, [this] { return _model && _model->isConnected(); });
    _model->setDrive(&_drive->model());
    setDriveActions();
    setUpdateMessage(connecting);
    _dateFormatter =
        std::make_unique<DateFormatter>(_platform->model().clock, "'Updated' yyyy-MM-dd 'at' HH:mm:ss");
    const auto rootPane = std::make_shared<VelmoraPaneController>(nullptr, std::string(rootNodePath), *this);
    rootPane->setStatus("Connecting", true);
    _navController = std::make_shared<NavigationController>(rootPane);
    _navController->setDelegate(this);
    _window->setRootViewController(_drive->standBeside(_navController));
    if (_beginsWithDrive)
        _drive->open();
    setCommands();
    _window->setOnDrop([this](const std::string& path) { openRecording(path); });
    updateNotice();
    _window->makeKeyAndVisible();
    // The screen is up before the first exchange with the telephony service, which blocks. The display's
    // server exposes a new window when it gets to it, which may be long after this task.
    _platform->model().queue.async([this] { _window->whenPainted([this] { start(); }); });
}

void VelmoraApp::start() {
    if (_recordingPath.empty())
        connectFirst();
    else
        openRecording(_recordingPath, _recordingTechnology);
}

void VelmoraApp::connectFirst() {
    if (_willConnect)
        if (const auto done = _willConnect(); !done) {
            logFormat(LogPriority::Error, "telephony service: %s", done.reason().c_str());
            _notice.setStartFailure(done.reason());
            // Which needs no second line if nothing else has been started either.
            _loggedProblem = _notice.line({ConnectionProblem::Kind::NoService, {}});
        }
    _model->restartMonitor();
}

void VelmoraApp::applicationWillTerminate() {
    _setGSMRSSI(false);
    setUpdateMessage({});
    _dateFormatter.reset();
    setSaveViewController(nullptr);
    if (_window)
        _window->setHidden(true);
    _recording->stop();
    _report.reset();
    _navController->setAccessories({});
    _drive->setRecorded(nullptr);
    _playback.reset();
    setWindow(nullptr);
    _model->setDrive(nullptr);
    _model.reset();
}

const VelmoraModel& VelmoraApp::model() const {
    return *_model;
}

void VelmoraApp::getSaveButtonPref() {
    setAllowSaveButton(_platform->files().exists(internalInstallMarker));
}

void VelmoraApp::_setGSMRSSI(bool isShown) {
    Preferences& preferences = _platform->preferences();
    preferences.setBoolean(homeScreenDomain, showGSMRSSIKey, isShown);
    preferences.synchronize(homeScreenDomain);
    preferences.announceChange(homeScreenDomain, showGSMRSSIKey);
}

void VelmoraApp::showSaveView() {
    if (_saveViewController)
        return;
    if (_playback) {
        _playback->pause();
        const Player::Saved saved = _playback->saved();
        _saveViewController =
            std::make_shared<VelmoraSaveViewController>(saved.contents, *this, saved.refresh);
    } else {
        _saveViewController = std::make_shared<VelmoraSaveViewController>(_model->getSaveContents(), *this);
    }
    _navController->presentModalViewController(_saveViewController, true);
}

void VelmoraApp::closeSaveView() {
    if (!_saveViewController)
        return;
    _navController->dismissModalViewController(true);
    _saveViewController.reset();
    if (std::exchange(_endsOnceSaved, false) && _hasNewSnapshot)
        startAnew();
}

std::optional<MaskSeal> VelmoraApp::maskSeal() const {
    return _privacy ? _privacy->seal() : std::nullopt;
}

void VelmoraApp::snapshotWritten(const std::string& path) {
    _hasNewSnapshot = true;
    _snapshotNotice.setPath(path);
    updateNotice();
    _platform->model().queue.after(snapshotNoticeTime, [this, snapshot = ++_snapshots] {
        if (!_model || snapshot != _snapshots) // shut down, or a later one has its own time
            return;
        _snapshotNotice.clear();
        updateNotice();
    });
}

void VelmoraApp::startAnew() {
    const ArrayRef contents = _model->getSaveContents();
    if (allowSaveButton() && contents && !contents->empty() && !std::exchange(_offeredSave, true)) {
        _endsOnceSaved = true;
        _hasNewSnapshot = false;
        showSaveView();
        return;
    }
    _startsAnew = true;
    terminate();
}

void VelmoraApp::togglePrivacy() {
    if (!_model) // shut down
        return;
    _privacy->setOn(!_privacy->isOn());
    // A recording holds identities or pseudonyms, never both.
    _recording->stop("identities are masked otherwise now");
    _report->cancel();
    // What was decoded so far is in the decoder, the tree, the panes and the save screen's copy.
    _endsOnceSaved = false;
    closeSaveView();
    if (_recordingPath.empty())
        _model->forget();
    _drive->forget();
    clearPanes();
    if (_playback)
        if (const auto done = _playback->reopen(); !done)
            Alert("Recording", done.reason(), "Close").show();
    updateNotice();
    if (!_recordingPath.empty())
        return;
    _window->displayIfNeeded(); // the connection may block for seconds
    _platform->model().queue.async([model = _model] { model->restartMonitor(); });
}

void VelmoraApp::clearPanes() {
    const auto root =
        std::static_pointer_cast<VelmoraPaneController>(_navController->viewControllers().front());
    _navController->popToViewController(*root, false);
    root->reloadWithNode(nullptr);
    setUpdateMessage(connecting);
    updateStatusForViewController(*root);
}

void VelmoraApp::updateStatusForViewController(VelmoraPaneController& pane) {
    if (_playback || _model->isConnected())
        pane.setStatus(updateMessage(), false);
    else
        pane.setStatus(connecting, true);
}

void VelmoraApp::updateViewControllerFromModel() {
    if (_playback)
        return; // what is received is not shown
    if (_model->isConnected())
        setUpdateMessage(_dateFormatter->stringFromDate(_platform->model().clock.now()));
    redraw();
    updateNotice();
}

void VelmoraApp::redraw() {
    // Only panes are ever put on the stack. Popping changes it, so the loop runs over a copy.
    const std::vector<std::shared_ptr<ViewController>> panes = _navController->viewControllers();
    for (std::size_t i = 0; i < panes.size(); ++i) {
        auto& pane = static_cast<VelmoraPaneController&>(*panes[i]);
        NodeRef node = i == 0      ? (_playback ? _playback->topLevelNodes() : _model->topLevelNodes())
                       : _playback ? _playback->nodeAtPath(pane.path())
                                   : _model->nodeAtPath(pane.path());
        if (i > 0 && !node) {
            _navController->popToViewController(*panes[i - 1], true);
            break;
        }
        pane.reloadWithNode(std::move(node));
    }
    updateStatusForViewController(static_cast<VelmoraPaneController&>(*_navController->topViewController()));
}

void VelmoraApp::connectionChanged() {
    if (!_model) // shut down, while a retry that is due keeps the model
        return;
    _recording->connectionChanged(_model->technology(), _model->isConnected());
    if (_playback)
        return;
    updateStatusForViewController(static_cast<VelmoraPaneController&>(*_navController->topViewController()));
    updateNotice();
    const std::string line = _notice.line(_model->problem());
    if (!line.empty() && line != _loggedProblem)
        logLine(LogPriority::Error, line);
    if (!line.empty() || _model->isConnected())
        _loggedProblem = line;
    if (_model->isConnected())
        return;
    _drive->linkLost();
    _window->displayIfNeeded(); // the next attempt to connect may block for seconds
}

void VelmoraApp::updateNotice() {
    Notice notice =
        _report->before(_snapshotNotice.before(_playback ? _playback->notice() : connectionNotice()));
    if (const std::string recorded = _recording->notice(); !recorded.empty())
        notice.text = notice.text.empty() ? recorded : recorded + " " + notice.text;
    if (_privacy->isOn())
        notice.text = notice.text.empty() ? maskedNotice : maskedNotice + (" " + notice.text);
    _navController->setNotice(std::move(notice));
}

Notice VelmoraApp::connectionNotice() {
    if (std::string problem = _notice.sentences(_model->problem()); !problem.empty())
        return {std::move(problem), {}, {}};
    std::string change = ConnectionNotice::ofTechnologies(*_model);
    if (change.empty())
        return {};
    return {std::move(change), "Start Anew", [this] { startAnew(); }};
}

void VelmoraApp::willShowViewController(NavigationController&, ViewController& viewController, bool) {
    updateStatusForViewController(static_cast<VelmoraPaneController&>(viewController));
}

} // namespace velmora

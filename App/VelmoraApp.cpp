// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/VelmoraApp.h"

#include "App/MaskingModel.h"
#include "App/VelmoraPaneController.h"
#include "App/VelmoraSaveViewController.h"
#include "Model/NodePath.h"
#include "Platform/SystemLog.h"
#include "Toolkit/Navigation/NavigationController.h"
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
constexpr char privacyKey = 'M';
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
    if (_model)
        _model->destroyPorts();
}

void VelmoraApp::applicationDidFinishLaunching(Application&) {
    getSaveButtonPref();
    _window = std::make_shared<Window>(Screen::mainBounds());
    _privacy = std::make_unique<PrivacySwitch>(_platform->preferences(), _maskKey);
    _model = std::make_shared<MaskingModel>(_platform->model(), this, *_privacy);
    setUpdateMessage(connecting);
    _dateFormatter =
        std::make_unique<DateFormatter>(_platform->model().clock, "'Updated' yyyy-MM-dd 'at' HH:mm:ss");
    const auto rootPane = std::make_shared<VelmoraPaneController>(nullptr, std::string(rootNodePath), *this);
    rootPane->setStatus("Connecting", true);
    _navController = std::make_shared<NavigationController>(rootPane);
    _navController->setDelegate(this);
    _window->setRootViewController(_navController);
    _window->setCommand(privacyKey, [this] { togglePrivacy(); });
    updateNotice();
    _window->makeKeyAndVisible();
    // The screen is up before the first exchange with the telephony service, which blocks. The display's
    // server exposes a new window when it gets to it, which may be long after this task.
    _platform->model().queue.async([this] { _window->whenPainted([this] { connectFirst(); }); });
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
    setWindow(nullptr);
    _model.reset();
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
    _saveViewController = std::make_shared<VelmoraSaveViewController>(_model->getSaveContents(), *this);
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
    // What was decoded so far is in the decoder, the tree, the panes and the save screen's copy.
    _endsOnceSaved = false;
    closeSaveView();
    _model->forget();
    clearPanes();
    updateNotice();
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
    if (_model->isConnected())
        pane.setStatus(updateMessage(), false);
    else
        pane.setStatus(connecting, true);
}

void VelmoraApp::updateViewControllerFromModel() {
    // Only panes are ever put on the stack. Popping changes it, so the loop runs over a copy.
    const std::vector<std::shared_ptr<ViewController>> panes = _navController->viewControllers();
    for (std::size_t i = 0; i < panes.size(); ++i) {
        auto& pane = static_cast<VelmoraPaneController&>(*panes[i]);
        NodeRef node = i == 0 ? _model->topLevelNodes() : _model->nodeAtPath(pane.path());
        if (i > 0 && !node) {
            _navController->popToViewController(*panes[i - 1], true);
            break;
        }
        pane.reloadWithNode(std::move(node));
    }
    if (_model->isConnected())
        setUpdateMessage(_dateFormatter->stringFromDate(_platform->model().clock.now()));
    updateStatusForViewController(static_cast<VelmoraPaneController&>(*_navController->topViewController()));
    updateNotice();
}

void VelmoraApp::connectionChanged() {
    if (!_model) // shut down, while a retry that is due keeps the model
        return;
    updateStatusForViewController(static_cast<VelmoraPaneController&>(*_navController->topViewController()));
    updateNotice();
    const std::string line = _notice.line(_model->problem());
    if (!line.empty() && line != _loggedProblem)
        logLine(LogPriority::Error, line);
    if (!line.empty() || _model->isConnected())
        _loggedProblem = line;
    if (!_model->isConnected())
        _window->displayIfNeeded(); // the next attempt to connect may block for seconds
}

void VelmoraApp::updateNotice() {
    Notice notice = _snapshotNotice.before(connectionNotice());
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

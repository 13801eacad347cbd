// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/DriveView/DriveScreen.h"
#include "App/MaskingModel.h"
#include "App/Recording/RecordingSwitch.h"
#include "App/VelmoraApp.h"
#include "App/VelmoraPaneController.h"
#include "Toolkit/Navigation/NavigationController.h"
#include "Toolkit/Window.h"

// The keys that the application has on whatever screen, with Ctrl.

namespace velmora {

namespace {

constexpr char privacyKey = 'M';
constexpr char driveKey = 'D';
constexpr char pinKey = 'P';
constexpr char closeKey = 'W';
constexpr char recordKey = 'R';
constexpr char noteKey = 'B';

} // namespace

void VelmoraApp::setCommands() {
    _window->setCommand(privacyKey, [this] { togglePrivacy(); });
    _window->setCommand(driveKey, [this] { _drive->toggle(); });
    _window->setCommand(pinKey, [this] { pinFocusRow(); });
    _window->setCommand(closeKey, [this] { closeRecording(); });
    _window->setCommand(recordKey,
                        [this] { _recording->toggle(_model->technology(), _model->isConnected()); });
    _window->setShiftCommand(recordKey, [this] { askReport(); });
    _window->setCommand(noteKey, [this] { _recording->askNote(); });
}

void VelmoraApp::pinFocusRow() {
    if (_model)
        static_cast<VelmoraPaneController&>(*_navController->topViewController()).togglePinOfFocusRow();
}

} // namespace velmora

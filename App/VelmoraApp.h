// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "App/AppPlatform.h"
#include "App/ConnectionNotice.h"
#include "App/DateFormatter.h"
#include "App/PrivacySwitch.h"
#include "App/SnapshotNotice.h"
#include "Model/VelmoraModel.h"
#include "Platform/Result.h"
#include "Toolkit/Application.h"
#include "Toolkit/ApplicationDelegate.h"
#include "Toolkit/Navigation/NavigationControllerDelegate.h"
#include "Toolkit/Notice.h"

#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <utility>

namespace velmora {

class DriveScreen;
class MaskingModel;
class NavigationController;
class PlaybackController;
class RecordingSwitch;
class ReportSwitch;
class VelmoraPaneController;
class VelmoraSaveViewController;
class Window;

/// The application object and its own delegate: it brings the screens up, starts the model, and from then on
/// is the bridge between the two. It owns the platform, the window, the stack of panes and the model, and
/// outlives everything else but the log and the resources. One a process, like its base. Main thread only.
class VelmoraApp final : public Application,
                         public ApplicationDelegate,
                         public NavigationControllerDelegate,
                         public ModelObserver {
public:
    using PlatformMaker = std::function<std::unique_ptr<AppPlatform>()>;

    /// `makePlatform` is called once the event loop exists, which the platform needs.
    VelmoraApp(int& argc, char** argv, const PlatformMaker& makePlatform);
    ~VelmoraApp() override;

    /// Runs the application's loop with this object as the delegate; returns as its base's does.
    using Application::run;
    [[nodiscard]] int run() { return run(*this); }

    void applicationDidFinishLaunching(Application& application) override;
    /// Has no argument, so the toolkit never calls it, nor does anything else: the preference is not reset at
    /// exit. That is intended.
    void applicationWillTerminate();
    /// The toolkit's notice does nothing here.
    using ApplicationDelegate::applicationWillTerminate;

    /// Panes offer the save button on internal installs alone.
    void getSaveButtonPref();
    /// Switches the home screen's display of the received signal strength.
    void _setGSMRSSI(bool isShown);

    /// What is done before the first attempt to connect, once the window is on the screen; a failure is
    /// logged and shown. Set before the application runs.
    void setWillConnect(std::function<Result<Done>()> willConnect) { _willConnect = std::move(willConnect); }

    /// The key of masked identities; a random one by default. Set before the application runs.
    void setMaskKey(const MaskKey& key) { _maskKey = key; }
    /// Set before the application runs: it shows this recording instead of connecting to a service.
    void setRecording(std::string path, std::string technology) {
        _recordingPath = std::move(path);
        _recordingTechnology = std::move(technology);
    }
    /// Shows a recording on the panes, in place of what is received or of another one; see
    /// PlaybackController::open. A failure says so on the screen and changes nothing.
    void openRecording(const std::string& path, const std::string& technology = {});
    /// Shows what is received again.
    void closeRecording();
    /// What records what is received. Precondition: the application has launched.
    [[nodiscard]] RecordingSwitch& recording() const { return *_recording; }
    /// The recording that is shown; null for what is received.
    [[nodiscard]] PlaybackController* playback() const { return _playback.get(); }

    /// "Report...": asks how, and has a page made of the recording that is shown or, without one, of the one
    /// that is being made.
    void askReport();
    /// Precondition: the application has launched.
    [[nodiscard]] ReportSwitch& report() const { return *_report; }

    /// Masks identities, or shows them again: on the panes, on the save screen and in what that writes.
    /// The panes begin empty, with a new connection, so that nothing decoded before is shown.
    void togglePrivacy();

    /// Shows the drive view at first, on a narrow window too. Set before the application runs.
    void setBeginsWithDrive(bool begins) { _beginsWithDrive = begins; }
    /// Pins the row of the top pane that has the keyboard as a chart of the drive view, or takes it off;
    /// nothing for a row without a number.
    void pinFocusRow();

    /// The notice's button after a change of technology: ends the application, for its caller to start it
    /// anew. Where there is something to save and panes offer that, the save screen comes first: once a
    /// snapshot is written the application ends; without one it takes another press.
    void startAnew();
    /// Whether the application has ended to be started anew.
    [[nodiscard]] bool startsAnew() const { return _startsAnew; }
    /// The save screen has written this snapshot, which a notice names for a while.
    void snapshotWritten(const std::string& path);

    /// Opens the save screen; does nothing while it is open.
    void showSaveView();
    /// Closes the save screen; does nothing when it is not open.
    void closeSaveView();
    /// What a snapshot says of itself; absent where messages are not masked.
    [[nodiscard]] std::optional<MaskSeal> maskSeal() const;

    void updateStatusForViewController(VelmoraPaneController& pane);
    void updateViewControllerFromModel() override;
    void connectionChanged() override;
    void willShowViewController(NavigationController& navigationController, ViewController& viewController,
                                bool animated) override;

    // Properties; their storage is their own, not the fields of like name.
    [[nodiscard]] bool allowSaveButton() const { return _properties.allowSaveButton; }
    void setAllowSaveButton(bool isAllowed) { _properties.allowSaveButton = isAllowed; }
    [[nodiscard]] const std::shared_ptr<VelmoraSaveViewController>& saveViewController() const {
        return _properties.saveViewController;
    }
    void setSaveViewController(std::shared_ptr<VelmoraSaveViewController> controller) {
        _properties.saveViewController = std::move(controller);
    }
    [[nodiscard]] const std::shared_ptr<Window>& window() const { return _properties.window; }
    void setWindow(std::shared_ptr<Window> window) { _properties.window = std::move(window); }
    /// The status shown while connected.
    [[nodiscard]] const std::string& updateMessage() const { return _properties.updateMessage; }
    void setUpdateMessage(std::string message) { _properties.updateMessage = std::move(message); }

    /// Precondition for both: the application has launched.
    [[nodiscard]] NavigationController& navController() const { return *_navController; }
    [[nodiscard]] const VelmoraModel& model() const;
    [[nodiscard]] AppPlatform& platform() const { return *_platform; }
    [[nodiscard]] DriveScreen& drive() const { return *_drive; }

private:
    struct Properties {
        bool allowSaveButton = false;
        std::shared_ptr<VelmoraSaveViewController> saveViewController;
        std::shared_ptr<Window> window;
        std::string updateMessage;
    };

    void start();
    void connectFirst();
    void clearPanes();
    /// Has the panes show the display as it is now.
    void redraw();
    void showMoment();
    /// Puts the bars of recordings that are played and made below the panes.
    void showBars();
    void makeRecordingSwitch();
    void setCommands();
    void setDriveActions();
    /// What the bar above the panes says: that identities are masked, and the connection's problem or that
    /// the panes do not show what is received.
    void updateNotice();
    [[nodiscard]] Notice connectionNotice();

    std::unique_ptr<AppPlatform> _platform;

    std::shared_ptr<Window> _window;
    std::shared_ptr<NavigationController> _navController;
    std::shared_ptr<VelmoraSaveViewController> _saveViewController;
    std::optional<MaskKey> _maskKey;
    std::unique_ptr<PrivacySwitch> _privacy; ///< the model refers to it
    std::unique_ptr<DriveScreen> _drive;     ///< so does it to this
    std::shared_ptr<MaskingModel> _model;
    [[maybe_unused]] bool _allowSaveButton = false; ///< unused: the property has the flag
    std::string _recordingPath;
    std::string _recordingTechnology;
    std::unique_ptr<PlaybackController> _playback;
    std::unique_ptr<RecordingSwitch> _recording;
    std::unique_ptr<ReportSwitch> _report;
    std::unique_ptr<DateFormatter> _dateFormatter;
    [[maybe_unused]] std::string _updateMessage; ///< unused: the property has the text
    Properties _properties;

    std::function<Result<Done>()> _willConnect;
    ConnectionNotice _notice;
    SnapshotNotice _snapshotNotice;
    int _snapshots = 0; ///< written so far
    std::string _loggedProblem;
    bool _beginsWithDrive = false;
    bool _startsAnew = false;
    bool _offeredSave = false;    ///< the notice's button has opened the save screen
    bool _endsOnceSaved = false;  ///< that save screen is open
    bool _hasNewSnapshot = false; ///< and has written
};

} // namespace velmora

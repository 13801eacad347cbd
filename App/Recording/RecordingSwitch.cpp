// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/Recording/RecordingSwitch.h"

#include "Platform/PrintableText.h"
#include "Platform/SystemLog.h"

#include <chrono>
#include <utility>

namespace velmora {

RecordingSwitch::RecordingSwitch(AppPlatform& platform, std::function<void()> barsChanged,
                                 std::function<void()> noticeChanged,
                                 std::function<void(const std::string& text)> noted)
    : _platform(platform), _barsChanged(std::move(barsChanged)), _noticeChanged(std::move(noticeChanged)),
      _noted(std::move(noted)) {}

void RecordingSwitch::toggle(std::string_view technology, bool isConnected) {
    if (isOn())
        stop();
    else
        start(technology, isConnected);
}

void RecordingSwitch::start(std::string_view technology, bool isConnected) {
    const ModelPlatform platform = _platform.model();
    const auto now = std::chrono::floor<std::chrono::seconds>(platform.clock.now());
    const std::string path = _platform.files().diagnosticLogDirectory() + "/VelmoraRecording-" +
                             std::to_string(now.time_since_epoch().count()) + ".pcapng";
    Result<std::unique_ptr<LiveRecording>> started =
        LiveRecording::start(platform.queue, platform.clock, path,
                             {[this] { showStatus(); }, [this](const std::string& reason) { stop(reason); }});
    if (!started) {
        logLine(LogPriority::Error, "recording: " + started.reason());
        say("Nothing is recorded: " + started.reason() + ".");
        return;
    }
    _recording = *std::move(started);
    _bar = std::make_unique<RecordingBar>(
        RecordingBar::Actions{// Once the button's press is over, which the bar does not outlive.
                              [this] { _platform.model().queue.async([this] { stop(); }); },
                              [this](const std::string& text) { note(text); }});
    _barsChanged();
    connectionChanged(technology, isConnected);
    say({});
    showStatus();
}

void RecordingSwitch::stop(const std::string& reason) {
    if (!_recording)
        return;
    const std::unique_ptr<LiveRecording> ended = std::move(_recording);
    const Result<std::string> outcome = ended->stop();
    const std::unique_ptr<RecordingBar> gone = std::move(_bar);
    _barsChanged();
    std::string text = outcome ? *outcome : outcome.reason();
    if (!outcome)
        logLine(LogPriority::Error, "recording: " + text);
    say((reason.empty() ? std::string() : "The recording has ended: " + reason + ". ") + text);
}

void RecordingSwitch::take(const Data& message) {
    if (_recording)
        _recording->take(message);
}

void RecordingSwitch::connectionChanged(std::string_view technology, bool isConnected) {
    if (!_recording)
        return;
    if (isConnected)
        _recording->setTechnology(technology);
    if (_recording)
        _recording->setConnected(isConnected);
}

void RecordingSwitch::askNote() {
    if (_bar)
        _bar->askNote();
    else
        say("A note goes into a recording. Ctrl-R starts one.");
}

void RecordingSwitch::bookmark() {
    if (_recording)
        note("Bookmark");
}

void RecordingSwitch::note(const std::string& text) {
    _recording->note(text);
    _noted(text);
}

void RecordingSwitch::showStatus() {
    if (!_recording || !_bar)
        return;
    _bar->setStatus(_recording->status());
    if (notice() != _shownNotice) {
        _shownNotice = notice();
        _noticeChanged();
    }
}

std::string RecordingSwitch::notice() const {
    return printable(_recording ? _recording->problem() : _outcome);
}

void RecordingSwitch::say(std::string text) {
    _outcome = std::move(text);
    _shownNotice = notice();
    _noticeChanged();
}

} // namespace velmora

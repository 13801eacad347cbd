// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/Report/ReportSwitch.h"

#include "Platform/PrintableText.h"
#include "Platform/SystemLog.h"
#include "Toolkit/Alert.h"

#include <chrono>
#include <utility>

namespace velmora {

ReportSwitch::ReportSwitch(AppPlatform& platform, Host host) : _platform(platform), _host(std::move(host)) {}

void ReportSwitch::ask(const std::string& path, PlayedDecoder::Masking masking) {
    if (isOn())
        return;
    if (path.empty()) {
        say("There is no recording to report on. Open one, or start one with Ctrl-R.");
        return;
    }
    const std::string name = printable(path.substr(path.rfind('/') + 1));
    Alert question("Report",
                   "A page about " + name + " is made and opened in the browser. " +
                       (masking ? "Identities are masked, and positions and notes are left out."
                                : "Identities of subscriber and phone are left out unless you include them."),
                   "Cancel");
    question.addAnswer("Make Report", [this, path, masking] { start(path, masking, false); });
    if (!masking)
        question.addAnswer("With Identities", [this, path] { start(path, {}, true); });
    question.show();
}

void ReportSwitch::start(const std::string& path, PlayedDecoder::Masking masking, bool hasIdentities) {
    ReportMaker::Events events;
    events.progressed = [this] {
        if (std::exchange(_shownProgress, _maker->progress()) != _maker->progress())
            _host.noticeChanged();
    };
    events.done = [this](const Result<std::string>& page) {
        // Once its step is over, which the maker does not outlive.
        _platform.model().queue.async([this, page] {
            if (isOn())
                done(page);
        });
    };
    Result<std::unique_ptr<ReportMaker>> made = ReportMaker::begin(
        _platform.model(), {path, hasIdentities, std::move(masking), _platform.ruleFiles()},
        std::move(events));
    if (!made) {
        done(Failure{made.reason()});
        return;
    }
    _maker = *std::move(made);
    _shownProgress = -1;
    _outcome.clear();
    _host.noticeChanged();
}

void ReportSwitch::cancel() {
    if (std::exchange(_maker, nullptr))
        say("The report is cancelled.");
}

void ReportSwitch::done(const Result<std::string>& page) {
    _maker.reset();
    const auto now = std::chrono::floor<std::chrono::seconds>(_platform.model().clock.now());
    const std::string path = _platform.files().diagnosticLogDirectory() + "/VelmoraReport-" +
                             std::to_string(now.time_since_epoch().count()) + ".html";
    const Result<Done> written =
        page ? _platform.files().writeDirectly(path, *page) : Result<Done>(Failure{page.reason()});
    if (!written) {
        logLine(LogPriority::Error, "report: " + written.reason());
        say("There is no report: " + written.reason() + ".");
        return;
    }
    say("The report is " + path + (_host.open(path) ? "." : "; nothing here opens it."));
}

void ReportSwitch::say(std::string text) {
    _outcome = printable(std::move(text));
    _host.noticeChanged();
}

Notice ReportSwitch::before(Notice other) {
    const std::string text =
        isOn() ? "The report is being made: " + std::to_string(_maker->progress()) + " %." : _outcome;
    if (text.empty())
        return other;
    other.text = other.text.empty() ? text : text + " " + other.text;
    if (isOn()) {
        other.title = "Cancel";
        other.action = [this] { cancel(); };
    }
    return other;
}

} // namespace velmora

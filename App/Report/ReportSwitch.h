// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "App/AppPlatform.h"
#include "App/Report/ReportMaker.h"
#include "Toolkit/Notice.h"

#include <functional>
#include <memory>
#include <string>

namespace velmora {

/// Asks how a recording's page is to be made, has it made, and opens it in the browser: "Report…". The page
/// goes beside the snapshots: "VelmoraReport-SECONDS.html". Main thread only.
class ReportSwitch {
public:
    struct Host {
        std::function<void()> noticeChanged;
        /// Opens the page; false where nothing does.
        std::function<bool(const std::string& path)> open;
    };

    /// `platform` must outlive it.
    ReportSwitch(AppPlatform& platform, Host host);

    /// Asks, or says that there is nothing to make a page of where the path is empty. `masking`: as
    /// ReportMaker; with it identities are masked, and not asked about.
    void ask(const std::string& path, PlayedDecoder::Masking masking);
    void start(const std::string& path, PlayedDecoder::Masking masking, bool hasIdentities);
    void cancel();
    [[nodiscard]] bool isOn() const { return _maker != nullptr; }

    /// How far it is, with a button that cancels, or where the page is; the other one beside it.
    [[nodiscard]] Notice before(Notice other);

private:
    void done(const Result<std::string>& page);
    void say(std::string text);

    AppPlatform& _platform;
    Host _host;
    std::unique_ptr<ReportMaker> _maker;
    int _shownProgress = -1;
    std::string _outcome;
};

} // namespace velmora

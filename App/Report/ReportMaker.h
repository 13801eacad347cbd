// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/RuleSet.h"
#include "Export/Report/DriveReport.h"
#include "Export/Tracks/TrackCollector.h"
#include "Model/VelmoraModel.h"
#include "Platform/MainQueue.h"
#include "Platform/Result.h"
#include "Playback/PlayedDecoder.h"
#include "Recording/MessageReader.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// Makes the page of a recording from its front, in steps of some milliseconds on the main queue, so that the
/// screens go on meanwhile. Destroying it cancels that. Main thread only.
class ReportMaker {
public:
    struct Options {
        std::string path; ///< the recording's, which may still grow: what is in it then is on the page
        bool hasIdentities = false;     ///< as of DriveReport, on an unmasked page
        PlayedDecoder::Masking masking; ///< null where messages are shown as they are
        std::vector<RuleFile> rules;
    };
    struct Events {
        std::function<void()> progressed;
        /// The page, or why there is none. It may destroy the maker.
        std::function<void(Result<std::string> page)> done;
    };

    /// Opens the recording and begins. The platform's queue and clock must outlive it.
    static Result<std::unique_ptr<ReportMaker>> begin(const ModelPlatform& platform, Options options,
                                                      Events events);
    ~ReportMaker();
    ReportMaker(const ReportMaker&) = delete;
    ReportMaker& operator=(const ReportMaker&) = delete;

    /// In percent.
    [[nodiscard]] int progress() const { return _progress; }

private:
    class Technology;

    ReportMaker(const ModelPlatform& platform, Options options, Events events);
    void loadRules();
    void step();
    void take(const LoggedMessage& message);
    void reportLosses();
    [[nodiscard]] Technology* at(std::uint32_t index);
    void showProgress(std::uint64_t offset);
    void finish();

    ModelPlatform _platform;
    Options _options;
    Events _events;
    std::vector<std::unique_ptr<LogGenerator>> _ruleDecoders; ///< whose catalogues the rules refer to
    std::unique_ptr<RuleSet> _rules;
    std::unique_ptr<MessageReader> _reader;
    std::unique_ptr<TrackCollector> _track; ///< none while identities are masked
    std::vector<std::unique_ptr<Technology>> _technologies;
    std::unique_ptr<DriveReport> _report; ///< of the decoders' catalogues
    std::unique_ptr<Timer> _timer;
    std::uint64_t _size = 0; ///< of the file
    std::uint64_t _losses = 0;
    int _progress = 0;
};

} // namespace velmora

// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/Report/ReportMaker.h"

#include "App/Playback/TimedSteps.h"
#include "Platform/TelephonyService.h"
#include "Playback/QuietDecoding.h"
#include "Recording/OpenMessages.h"

#include <algorithm>
#include <chrono>
#include <filesystem>
#include <system_error>
#include <utility>

namespace velmora {

namespace {

using namespace std::chrono_literals;

constexpr auto stepInterval = 4ms;
/// Between two looks at the time.
constexpr std::uint64_t messagesAtOnce = 100;

} // namespace

/// The decoder of one technology, which passes on what it observes.
class ReportMaker::Technology final : public ObservationSink {
public:
    Technology(DriveReport& report, std::unique_ptr<PlayedDecoder> decoder)
        : _report(report), _decoder(std::move(decoder)),
          _technology(report.of(_decoder->decoder().catalogue())) {
        _decoder->decoder().setObservationSink(this);
    }
    ~Technology() override { _decoder->decoder().setObservationSink(nullptr); }

    void take(const LoggedMessage& message) {
        _message = {0, message.number};
        const std::uint64_t undecoded = _decoder->undecoded();
        _decoder->take(message);
        if (_decoder->undecoded() == undecoded)
            return;
        _report.count(_message, message.time);
        _technology.reportUndecoded(_message, message.time, message.time);
    }
    void damaged(MessageNumber message, std::string_view reason) { _technology.damaged(message, reason); }
    void observed(const ObservedMessage& message) override {
        _report.count(_message, message.arrival);
        _technology.report({_message, message.arrival, message});
    }

private:
    DriveReport& _report;
    std::unique_ptr<PlayedDecoder> _decoder;
    TechnologyReport& _technology;
    MessageNumber _message;
};

Result<std::unique_ptr<ReportMaker>> ReportMaker::begin(const ModelPlatform& platform, Options options,
                                                        Events events) {
    const std::string path = options.path;
    std::unique_ptr<ReportMaker> made(new ReportMaker(platform, std::move(options), std::move(events)));
    Result<std::unique_ptr<MessageReader>> reader = openMessages(path);
    if (!reader)
        return Failure{reader.reason()};
    made->_reader = *std::move(reader);
    made->_reader->setReadsAllTechnologies(true);
    if (!made->_options.masking) // positions and notes are the person's
        made->_track = std::make_unique<TrackCollector>(*made->_reader);
    std::error_code unknown;
    const auto size = std::filesystem::file_size(path, unknown);
    made->_size = unknown ? 0 : size;
    made->loadRules();
    DriveReport::Options setup;
    setup.files = {std::filesystem::path(path).filename().string()};
    setup.rules = made->_rules.get();
    setup.hasIdentities = made->_options.hasIdentities;
    made->_report = std::make_unique<DriveReport>(std::move(setup));
    made->_timer = platform.queue.repeating(stepInterval, [maker = made.get()] { maker->step(); });
    return made;
}

ReportMaker::ReportMaker(const ModelPlatform& platform, Options options, Events events)
    : _platform(platform), _options(std::move(options)), _events(std::move(events)) {}

ReportMaker::~ReportMaker() {
    const QuietDecoding quiet;
    _timer.reset();
    _report.reset(); // refers to the decoders' catalogues
    _technologies.clear();
    _rules.reset();
    _ruleDecoders.clear();
    _track.reset();
}

void ReportMaker::loadRules() {
    const QuietDecoding quiet;
    std::vector<const Catalogue*> catalogues;
    for (const std::string_view technology : voxTechnologies)
        if (auto decoder = LogGenerator::generatorFromTechnology(technology, _platform.clock)) {
            catalogues.push_back(&decoder->catalogue());
            _ruleDecoders.push_back(std::move(decoder));
        }
    _rules = std::make_unique<RuleSet>(catalogues);
    for (const RuleFile& each : _options.rules)
        _rules->add(each); // the drive view has logged their mistakes
}

ReportMaker::Technology* ReportMaker::at(std::uint32_t index) {
    if (index >= _technologies.size())
        _technologies.resize(index + 1);
    if (_technologies[index])
        return _technologies[index].get();
    const std::vector<std::string> names = _reader->technologies();
    const std::string name = index < names.size() ? names[index] : _reader->technology();
    Result<std::unique_ptr<PlayedDecoder>> decoder = PlayedDecoder::make(name, _options.masking);
    if (!decoder) {
        _report->fail(0, decoder.reason());
        return nullptr;
    }
    _technologies[index] = std::make_unique<Technology>(*_report, *std::move(decoder));
    return _technologies[index].get();
}

void ReportMaker::step() {
    const QuietDecoding quiet;
    bool isAtEnd = false;
    static_cast<void>(inTime([this, &isAtEnd] {
        for (std::uint64_t i = 0; i < messagesAtOnce && !isAtEnd; ++i) {
            const std::optional<LoggedMessage> message = _reader->next();
            reportLosses();
            isAtEnd = !message;
            if (message)
                take(*message);
        }
        return isAtEnd;
    }));
    if (isAtEnd)
        finish();
    else if (_events.progressed)
        _events.progressed();
}

void ReportMaker::take(const LoggedMessage& message) {
    if (Technology* const technology = at(message.technology))
        technology->take(message);
    showProgress(message.offset);
}

void ReportMaker::showProgress(std::uint64_t offset) {
    if (_size > 0) // a compressed file unpacks to more
        _progress = static_cast<int>(std::min<std::uint64_t>(offset * 100 / _size, 99));
}

void ReportMaker::reportLosses() {
    const std::uint64_t losses = _reader->lossTotals().losses;
    if (std::exchange(_losses, losses) == losses)
        return;
    const std::vector<Loss>& kept = _reader->losses();
    const bool isKept = losses <= kept.size();
    for (const auto& each : _technologies)
        if (each)
            each->damaged({0, isKept ? kept.back().recordNumber : 0},
                          isKept ? std::string_view(kept.back().reason) : "damaged");
}

void ReportMaker::finish() {
    _timer.reset();
    if (_track) {
        _report->endInput(0, *_reader);
        _report->addTrack(_track->takeTrack());
    } else if (_reader->failure()) {
        _report->fail(0, _reader->failure()->reason);
    }
    _report->finish();
    std::string page;
    _report->write([&page](std::string_view text) { page += text; });
    const auto done = _events.done; // the call may destroy this
    done(std::move(page));
}

} // namespace velmora

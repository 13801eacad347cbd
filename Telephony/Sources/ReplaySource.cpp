// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Sources/ReplaySource.h"

#include "Platform/SystemLog.h"
#include "Platform/TelephonyService.h"

#include <algorithm>
#include <utility>

namespace velmora {
namespace {

constexpr std::chrono::nanoseconds longestPause = std::chrono::minutes(1);
constexpr std::chrono::nanoseconds loopPause = std::chrono::seconds(1);

} // namespace

Result<std::unique_ptr<ReplaySource>> ReplaySource::create(MainQueue& queue, const Clock& clock,
                                                           std::string name, Open open,
                                                           const Options& options) {
    auto reader = open();
    if (!reader)
        return Failure{name + ": " + reader.reason()};
    // Some files have no technology until the first messages are read.
    if ((*reader)->technology().empty())
        static_cast<void>((*reader)->next());
    if ((*reader)->failure())
        return Failure{name + ": " + (*reader)->failure()->reason};
    const std::string& named = options.technology.empty() ? (*reader)->technology() : options.technology;
    if (named.empty())
        return Failure{name + ": the file does not say which technology its messages are of; technology=NAME "
                              "supplies it"};
    std::string technology = technologyConstant(named);
    return std::unique_ptr<ReplaySource>(
        new ReplaySource(queue, clock, std::move(name), std::move(technology), std::move(open), options));
}

ReplaySource::ReplaySource(MainQueue& queue, const Clock& clock, std::string name, std::string technology,
                           Open open, const Options& options)
    : _name(std::move(name)), _technology(std::move(technology)), _open(std::move(open)), _loop(options.loop),
      _player(queue, clock, options.speed) {}

void ReplaySource::start(LogSink& sink) {
    _offset = std::chrono::nanoseconds::zero();
    if (rewind())
        _player.start(sink, [this] { return next(); });
}

void ReplaySource::stop() {
    _player.stop();
    _reader.reset();
}

bool ReplaySource::rewind() {
    auto reader = _open();
    if (!reader) {
        logFormat(LogPriority::Error, "%s: %s", _name.c_str(), reader.reason().c_str());
        _reader.reset();
        return false;
    }
    _reader = *std::move(reader);
    _lastTime.reset();
    _played = 0;
    return true;
}

std::optional<ScenarioEvent> ReplaySource::next() {
    if (!_reader)
        return std::nullopt;
    std::optional<LoggedMessage> message = _reader->next();
    reportLosses();
    if (!message) {
        reportEnd();
        // A round without messages would repeat without end.
        if (!_loop || _played == 0 || !rewind())
            return std::nullopt;
        _offset += loopPause;
        message = _reader->next();
        if (!message)
            return std::nullopt;
    }
    if (_lastTime)
        _offset += std::clamp(message->time - *_lastTime, std::chrono::nanoseconds::zero(), longestPause);
    _lastTime = message->time;
    ++_played;
    return ScenarioEvent{_offset, std::move(message->message)};
}

void ReplaySource::reportLosses() {
    const auto& losses = _reader->losses();
    for (; _lossesReported < losses.size(); ++_lossesReported) {
        const Loss& loss = losses[_lossesReported];
        logFormat(LogPriority::Warning, "%s: %llu bytes left out at offset %llu (record %llu): %s",
                  _name.c_str(), static_cast<unsigned long long>(loss.bytes),
                  static_cast<unsigned long long>(loss.offset),
                  static_cast<unsigned long long>(loss.recordNumber), loss.reason.c_str());
    }
}

void ReplaySource::reportEnd() {
    if (const auto& failure = _reader->failure())
        logFormat(LogPriority::Error, "%s: %s", _name.c_str(), failure->reason.c_str());
    const auto& totals = _reader->lossTotals();
    if (!_totalReported && totals.losses > _reader->losses().size()) {
        _totalReported = true;
        logFormat(LogPriority::Warning, "%s: %llu bytes left out in %llu places", _name.c_str(),
                  static_cast<unsigned long long>(totals.bytes),
                  static_cast<unsigned long long>(totals.losses));
    }
    if (!_loop)
        logFormat(LogPriority::Notice, "%s: played to the end, %llu messages", _name.c_str(),
                  static_cast<unsigned long long>(_played));
    else if (_played == 0)
        logFormat(LogPriority::Notice, "%s: holds no message", _name.c_str());
}

} // namespace velmora
